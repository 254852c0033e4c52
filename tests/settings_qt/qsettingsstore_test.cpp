#include "model/memorywindowview.h"
#include "model/options.h"
#include "model/qsettingsstore.h"

#include <map>
#include <string>
#include <vector>

#include <QDir>
#include <QFile>
#include <QSettings>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

// Every test works in a folder of its own and never reaches the user's real settings.
class QSettingsStoreTest : public testing::Test {
protected:
    QString iniPath(const QString& name = "settings.ini") const { return m_folder.filePath(name); }

    void writeRawFile(const QString& path, const QByteArray& content) const
    {
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        file.write(content);
    }

    QTemporaryDir m_folder;
};

// Keys that QSettings would otherwise split, trim, escape or fold together.
const std::vector<std::string> kHostileKeys = {
    "a/b",
    "a",
    "b",
    "a\\b",
    "/lead",
    "trail/",
    "a//b",
    "\\",
    "/",
    "k=v",
    "[Penmoor]",
    "[General]",
    "General",
    "a;b",
    "#hash",
    ";semi",
    "%41",
    "A",
    "%",
    "\"quoted\"",
    "'single'",
    " lead",
    "trail ",
    " ",
    "  ",
    "",
    "Grüße",
    "数量",
    "Rent",
    "RENT",
    "rent",
    "_rent",
    ".2f",
    ".",
    "-",
    "_",
    "line\nbreak",
    "tab\there",
    "a,b",
    "@Variant(0)",
    "Field1",
    "System Value - Rows",
    std::string("nul\0byte", 8),
};

TEST_F(QSettingsStoreTest, EveryKeyRoundTripsWithoutDisturbingAnother)
{
    {
        QSettingsStore store(iniPath());
        for (std::size_t i = 0; i < kHostileKeys.size(); ++i) {
            store.write(kHostileKeys[i], "value " + std::to_string(i));
        }
        store.sync();
    }
    QSettingsStore reopened(iniPath());
    for (std::size_t i = 0; i < kHostileKeys.size(); ++i) {
        EXPECT_EQ(reopened.read(kHostileKeys[i], "absent"), "value " + std::to_string(i))
            << "key \"" << kHostileKeys[i] << '"';
    }
    EXPECT_EQ(reopened.read("a/b/c", "absent"), "absent");
    EXPECT_EQ(reopened.read("rENT", "absent"), "absent");
}

TEST_F(QSettingsStoreTest, ValuesRoundTripExactly)
{
    const std::vector<std::string> values = {
        "",
        " ",
        "  lead and trail  ",
        "a,b",
        "a, b ,c",
        "\"quoted\"",
        "semi;colon",
        "#not a comment",
        "@Variant(0)",
        "@@",
        "back\\slash",
        "line\nbreak\r\n",
        "Grüße 数量 €",
        "=1+1",
        "True",
        std::string(100000, 'x'),
    };
    {
        QSettingsStore store(iniPath());
        for (std::size_t i = 0; i < values.size(); ++i) {
            store.write("key" + std::to_string(i), values[i]);
        }
        store.sync();
    }
    QSettingsStore reopened(iniPath());
    for (std::size_t i = 0; i < values.size(); ++i) {
        EXPECT_EQ(reopened.read("key" + std::to_string(i), "absent"), values[i]) << "value " << i;
    }
}

TEST_F(QSettingsStoreTest, TheWholeItemListSurvivesARestart)
{
    std::vector<std::string> names;
    {
        QSettingsStore store(iniPath());
        MemoryWindowView view;
        Options options(store, view, [] { return 2031; });
        options.LoadOptions(LoadMode::FromStore);
        for (const char* name : { "R&D / lab", "Rent \\ storage", "= totals =", "[misc]", " spaced ", "RENT" }) {
            options.InsertItem(name, options.count());
        }
        view.setSelectedListIndex(options.FindItemRow("RENT") - 1);
        view.setText(TextBox::Text1, "Harlenby; \"North\"");
        options.SaveOptions();
        for (int position = 1; position <= options.count(); ++position) {
            names.push_back(options.item(position).name);
        }
    }
    QSettingsStore store(iniPath());
    MemoryWindowView view;
    Options options(store, view, [] { return 2031; });
    options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(view.listEntries(), names);
    EXPECT_EQ(view.text(TextBox::Text1), "Harlenby; \"North\"");
    EXPECT_TRUE(options.item(options.FindItemRow("RENT")).included);
    EXPECT_FALSE(options.item(options.FindItemRow("Rent")).included);
}

TEST_F(QSettingsStoreTest, ValuesWrittenFromOutsideNeverBreakReading)
{
    // Keys in the store's own encoding, values that the program never writes.
    writeRawFile(iniPath(),
        "[General]\n"
        "_system.20_value.20-.20_rows=abc\n"
        "_system.20_value.20-.20_saved=@Variant(\\0\\0\\0\\x7f)\n"
        "_company=a, b ,c\n"
        "_year=@ByteArray(2013)\n"
        "_is_year=\"unterminated\n"
        "\x01\x02\xff\xfe garbage\n"
        "=no key\n");
    QSettingsStore store(iniPath());
    EXPECT_EQ(store.read("System Value - Saved", "absent"), "absent");
    EXPECT_EQ(store.read("Company", "absent"), "a,b,c");
    EXPECT_EQ(store.read("Year", "absent"), "2013");

    MemoryWindowView view;
    Options options(store, view, [] { return 2031; });
    options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(options.count(), 44);
    EXPECT_EQ(view.text(TextBox::Text2), "2013");
}

TEST_F(QSettingsStoreTest, AFileOfGarbageReadsAsEmptyAndIsReplacedOnSave)
{
    QByteArray garbage;
    for (int i = 0; i < 4096; ++i) {
        garbage.append(static_cast<char>(i * 7 + 3));
    }
    writeRawFile(iniPath(), garbage);
    QSettingsStore store(iniPath());
    MemoryWindowView view;
    Options options(store, view, [] { return 2031; });
    options.LoadOptions(LoadMode::FromStore);
    EXPECT_EQ(options.count(), 44);
    options.SaveOptions();

    QSettingsStore reopened(iniPath());
    EXPECT_EQ(reopened.read("System Value - Rows", ""), "44");
}

TEST_F(QSettingsStoreTest, ASaveThatCannotBeWrittenIsReported)
{
    writeRawFile(iniPath("not-a-folder"), "x");
    QSettingsStore store(iniPath("not-a-folder") + "/settings.ini");
    store.write("Company", "Acme");
    try {
        store.sync();
        FAIL() << "a save into a file's path reported success";
    } catch (const SettingsError& error) {
        EXPECT_NE(std::string(error.what()).find("not-a-folder"), std::string::npos) << error.what();
    }
}

TEST_F(QSettingsStoreTest, TheUsersStoreIsHarlenbyPenmoor)
{
    // Redirect the user's store into the test folder before the first use of it.
    QSettings::setPath(QSettings::NativeFormat, QSettings::UserScope, m_folder.path());
    QSettings::setPath(QSettings::IniFormat, QSettings::UserScope, m_folder.path());
    {
        QSettingsStore store;
        EXPECT_EQ(QDir::cleanPath(store.location()), QDir::cleanPath(m_folder.filePath("Harlenby/Penmoor.conf")));
        store.write("Company", "Acme");
        store.sync();
    }
    EXPECT_TRUE(QFile::exists(m_folder.filePath("Harlenby/Penmoor.conf")));
    EXPECT_EQ(QSettingsStore().read("Company", ""), "Acme");
}

} // namespace
} // namespace penmoor
