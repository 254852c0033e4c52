#include "shell/errorreport.h"
#include "tests/support/scripteddialogs.h"
#include "tests/support/temporaryfolder.h"
#include "ui/preview/saveresults.h"

#include <fstream>
#include <iterator>
#include <set>
#include <stdexcept>
#include <string>

#include <gtest/gtest.h>

namespace penmoor {
namespace {

namespace fs = std::filesystem;
using testing::ScriptedDialogs;

const SaveFileRequest kSaveDialog { "Save File", "Excel Files (*.xls)|*.xls|" };
const MessageRequest kDone = MessageRequest::plain("Done.");

MessageRequest overwriteQuestion(const fs::path& target)
{
    return MessageRequest::plain("Are you sure you wish to overwrite " + target.string() + " ?", MessageButtons::YesNo);
}

void writeFile(const fs::path& path, const std::string& contents)
{
    std::ofstream(path, std::ios::binary) << contents;
}

std::string readFile(const fs::path& path)
{
    std::ifstream in(path, std::ios::binary);
    return { std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>() };
}

class SaveResultsTest : public ::testing::Test {
protected:
    void SetUp() override { writeFile(workbook, built); }

    // The names in the folder, so a test sees every file a save left behind.
    std::set<std::string> filesInFolder() const
    {
        std::set<std::string> names;
        for (const fs::directory_entry& entry : fs::directory_iterator(folder.path())) {
            names.insert(entry.path().filename().string());
        }
        return names;
    }

    testing::TemporaryFolder folder;
    const fs::path workbook = folder / "qarnet12345678.xls";
    // Bytes that a text conversion would change: the copy must be exact.
    const std::string built = std::string("\xD0\xCF\x11\xE0 workbook\r\n\0\x1A end", 20);
    ScriptedDialogs dialogs;
};

TEST_F(SaveResultsTest, CancellingCopiesNothingAndStillSaysDone)
{
    dialogs.expect(kSaveDialog, "").expect(kDone);

    saveResults(dialogs, workbook);

    EXPECT_EQ(filesInFolder(), std::set<std::string>({ "qarnet12345678.xls" }));
}

TEST_F(SaveResultsTest, ANewNameGetsAnExactCopyUnderExactlyThatName)
{
    for (const std::string name : { "plan", "Plan 2013 (März).xls" }) {
        const fs::path target = folder / name;
        dialogs.expect(kSaveDialog, target.string()).expect(kDone);

        saveResults(dialogs, workbook);

        EXPECT_EQ(readFile(target), built) << name;
        EXPECT_EQ(filesInFolder(), std::set<std::string>({ "qarnet12345678.xls", name })) << name;
        fs::remove(target);
    }
}

TEST_F(SaveResultsTest, SavingTwiceGivesTwoIdenticalCopiesAndKeepsTheWorkbook)
{
    const fs::path first = folder / "first.xls";
    const fs::path second = folder / "second.xls";
    dialogs.expect(kSaveDialog, first.string()).expect(kDone);
    dialogs.expect(kSaveDialog, second.string()).expect(kDone);

    saveResults(dialogs, workbook);
    saveResults(dialogs, workbook);

    EXPECT_EQ(readFile(first), built);
    EXPECT_EQ(readFile(second), built);
    EXPECT_EQ(readFile(workbook), built);
}

TEST_F(SaveResultsTest, AnExistingFileIsReplacedOnlyAfterYes)
{
    const fs::path target = folder / "plan.xls";
    writeFile(target, "last year's plan");

    dialogs.expect(kSaveDialog, target.string()).expect(overwriteQuestion(target), DialogAnswer::No).expect(kDone);
    saveResults(dialogs, workbook);
    EXPECT_EQ(readFile(target), "last year's plan");

    dialogs.expect(kSaveDialog, target.string()).expect(overwriteQuestion(target), DialogAnswer::Yes).expect(kDone);
    saveResults(dialogs, workbook);
    EXPECT_EQ(readFile(target), built);
    EXPECT_EQ(filesInFolder(), std::set<std::string>({ "qarnet12345678.xls", "plan.xls" }));
}

TEST_F(SaveResultsTest, SavingOverTheWorkbookItselfKeepsIt)
{
    dialogs.expect(kSaveDialog, workbook.string()).expect(overwriteQuestion(workbook), DialogAnswer::Yes).expect(kDone);

    saveResults(dialogs, workbook);

    EXPECT_EQ(readFile(workbook), built);
    EXPECT_EQ(filesInFolder(), std::set<std::string>({ "qarnet12345678.xls" }));
}

TEST_F(SaveResultsTest, AMissingWorkbookIsReportedAndLeavesAnExistingFileAlone)
{
    fs::remove(workbook);
    const fs::path target = folder / "plan.xls";
    writeFile(target, "last year's plan");
    const std::string reason = std::make_error_code(std::errc::no_such_file_or_directory).message();

    dialogs.expect(kSaveDialog, target.string()).expect(overwriteQuestion(target), DialogAnswer::Yes);
    dialogs.expectErrorReport(
        "The workbook of the last build cannot be read from \"" + workbook.string() + "\": " + reason + ".",
        errorlocation::Form2PushButton6Click, 104);
    dialogs.expect(kDone);
    saveResults(dialogs, workbook);

    EXPECT_EQ(readFile(target), "last year's plan");
    EXPECT_EQ(filesInFolder(), std::set<std::string>({ "plan.xls" }));
}

TEST_F(SaveResultsTest, ATargetThatCannotBeWrittenIsReported)
{
    const fs::path inMissingFolder = folder / "no such folder" / "plan.xls";
    const fs::path onAFolder = folder / "plans";
    fs::create_directory(onAFolder);
    const struct {
        fs::path target;
        std::errc reason;
    } cases[] = {
        { inMissingFolder, std::errc::no_such_file_or_directory },
        { onAFolder, std::errc::is_a_directory },
    };
    for (const auto& c : cases) {
        dialogs.expect(kSaveDialog, c.target.string());
        dialogs.expectErrorReport("The workbook cannot be saved as \"" + c.target.string()
                + "\": " + std::make_error_code(c.reason).message() + ".",
            errorlocation::Form2PushButton6Click, 104);
        dialogs.expect(kDone);

        saveResults(dialogs, workbook);
    }
    EXPECT_TRUE(fs::is_empty(onAFolder));
    EXPECT_EQ(filesInFolder(), std::set<std::string>({ "qarnet12345678.xls", "plans" }));
}

// Dialogs whose save dialog cannot be shown.
class BrokenSaveDialog : public ScriptedDialogs {
public:
    std::string askSavePath(const SaveFileRequest&) override
    {
        throw std::runtime_error("The save dialog cannot be shown.");
    }
};

TEST(SaveResultsDialogTest, AFailingDialogIsReportedAndDoneFollows)
{
    testing::TemporaryFolder folder;
    BrokenSaveDialog dialogs;
    dialogs.expectErrorReport("The save dialog cannot be shown.", errorlocation::Form2PushButton6Click, 100);
    dialogs.expect(kDone);

    saveResults(dialogs, folder / "qarnet12345678.xls");

    EXPECT_TRUE(fs::is_empty(folder.path()));
}

} // namespace
} // namespace penmoor
