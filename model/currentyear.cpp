#include "model/currentyear.h"

#include <ctime>

namespace penmoor {

int currentCalendarYear()
{
    const std::time_t now = std::time(nullptr);
    // The program runs on one thread, so the shared buffer of localtime is safe here.
    const std::tm* local = std::localtime(&now);
    return local ? local->tm_year + 1900 : 1970;
}

} // namespace penmoor
