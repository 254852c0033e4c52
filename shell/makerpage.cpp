#include "shell/makerpage.h"

#include <cmath>

namespace penmoor {

bool isMakerPageDraw(double r)
{
    const int n = static_cast<int>(std::floor(r * 100)) + 1;
    return n == 7;
}

void OpenMakerPage(const UnitRandom& random, const AddressOpener& open)
{
    if (isMakerPageDraw(random())) {
        open(kMakerPageAddress);
    }
}

} // namespace penmoor
