#pragma once

#include <functional>

#include <QApplication>
#include <QTimer>
#include <QWidget>

namespace penmoor::testing {

// Runs handle on the next modal dialog as soon as it is up, so a test can inspect and close
// a real box that a call under test opens and waits on.
inline void whenModalAppears(std::function<void(QWidget*)> handle)
{
    auto* timer = new QTimer(qApp);
    timer->setInterval(5);
    QObject::connect(timer, &QTimer::timeout, [timer, handle = std::move(handle)] {
        if (QWidget* modal = QApplication::activeModalWidget(); modal && modal->isVisible()) {
            timer->stop();
            timer->deleteLater();
            handle(modal);
        }
    });
    timer->start();
}

} // namespace penmoor::testing
