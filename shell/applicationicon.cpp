#include "shell/applicationicon.h"

#include <QIcon>

namespace penmoor {

QIcon applicationIcon()
{
    QIcon icon;
    for (const int size : { 16, 32, 48, 64, 128, 256 }) {
        icon.addFile(QStringLiteral(":/penmoor/icons/penmoor-%1.png").arg(size), QSize(size, size));
    }
    return icon;
}

} // namespace penmoor
