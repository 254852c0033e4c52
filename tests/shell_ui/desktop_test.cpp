#include "shell/applicationicon.h"
#include "shell/desktop.h"
#include "shell/makerpage.h"

#include <QDesktopServices>
#include <QIcon>
#include <QObject>
#include <QUrl>

#include <gtest/gtest.h>

namespace penmoor {

// Stands in for the desktop's web browser.
class UrlRecorder : public QObject {
    Q_OBJECT
public:
    QList<QUrl> opened;

public slots:
    void open(const QUrl& url) { opened.append(url); }
};

namespace {

TEST(Desktop, TheMakersPageGoesToTheDesktopsBrowser)
{
    UrlRecorder browser;
    QDesktopServices::setUrlHandler(QStringLiteral("https"), &browser, "open");
    OpenMakerPage([] { return 0.5; }, openAddressOnDesktop);
    EXPECT_TRUE(browser.opened.isEmpty());
    OpenMakerPage([] { return 0.06; }, openAddressOnDesktop);
    QDesktopServices::unsetUrlHandler(QStringLiteral("https"));
    ASSERT_EQ(browser.opened.size(), 1);
    EXPECT_EQ(browser.opened.front(), QUrl(QStringLiteral("https://www.penmoor.example/")));
}

TEST(Desktop, TheApplicationIconComesInEverySize)
{
    const QIcon icon = applicationIcon();
    ASSERT_FALSE(icon.isNull());
    for (const int size : { 16, 32, 48, 64, 128, 256 }) {
        EXPECT_TRUE(icon.availableSizes().contains(QSize(size, size))) << size;
        EXPECT_EQ(icon.pixmap(size).size(), QSize(size, size)) << size;
    }
}

} // namespace
} // namespace penmoor

#include "desktop_test.moc"
