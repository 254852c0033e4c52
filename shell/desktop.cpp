#include "shell/desktop.h"

#include <QDesktopServices>
#include <QUrl>

namespace penmoor {

void openAddressOnDesktop(std::string_view address)
{
    QDesktopServices::openUrl(QUrl(QString::fromUtf8(address.data(), static_cast<qsizetype>(address.size()))));
}

} // namespace penmoor
