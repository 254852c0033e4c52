#include "tests/support/scripteddialogs.h"

#include <gtest/gtest-spi.h>
#include <gtest/gtest.h>

namespace penmoor {
namespace {

using testing::ScriptedDialogs;

TEST(ScriptedDialogs, AnswersTheExpectedPromptsInOrderAndLogsThem)
{
    ScriptedDialogs dialogs;
    const SaveFileRequest save { "Save File", "Excel Files (*.xls)|*.xls|" };
    dialogs.expect(MessageRequest::question("Delete?"), DialogAnswer::Yes)
        .expect(InputRequest { "Enter new row: ", "Input New Row", "" }, "Rent")
        .expect(save, "/home/u/plan.xls");

    EXPECT_EQ(dialogs.showMessage(MessageRequest::question("Delete?")), DialogAnswer::Yes);
    EXPECT_EQ(dialogs.askText({ "Enter new row: ", "Input New Row", "" }), "Rent");
    EXPECT_EQ(dialogs.askSavePath(save), "/home/u/plan.xls");

    ASSERT_EQ(dialogs.log().size(), 3u);
    EXPECT_EQ(std::get<MessageRequest>(dialogs.log()[0]).icon, MessageIcon::Question);
    EXPECT_EQ(dialogs.pending(), 0u);
}

TEST(ScriptedDialogs, AnUntitledBoxMatchesTheApplicationTitle)
{
    ScriptedDialogs dialogs;
    MessageRequest untitled = MessageRequest::plain("Done.");
    untitled.title.clear();
    dialogs.expect(untitled);
    dialogs.showMessage(MessageRequest::plain("Done."));
    EXPECT_EQ(std::get<MessageRequest>(dialogs.log()[0]).title, "Penmoor");
}

TEST(ScriptedDialogs, FailsTheTestOnEveryDeviation)
{
    EXPECT_NONFATAL_FAILURE(
        {
            ScriptedDialogs dialogs;
            EXPECT_EQ(dialogs.showMessage(MessageRequest::question("Sure?")), DialogAnswer::No);
        },
        "Unexpected prompt: message box \"Sure?\"");

    EXPECT_NONFATAL_FAILURE(
        {
            ScriptedDialogs dialogs;
            dialogs.expect(MessageRequest::question("Sure?"), DialogAnswer::Yes);
            MessageRequest differentDefault = MessageRequest::question("Sure?");
            differentDefault.defaultButton = DialogAnswer::Yes;
            EXPECT_EQ(dialogs.showMessage(differentDefault), DialogAnswer::No);
            dialogs.showMessage(MessageRequest::question("Sure?"));
        },
        "expected: message box \"Sure?\", Yes/No, question, title \"Question\", default No");

    EXPECT_NONFATAL_FAILURE(
        {
            ScriptedDialogs dialogs;
            dialogs.expect(InputRequest { "Enter new row: ", "Input New Row", "" }, "Rent");
        },
        "Expected prompt never shown: input box \"Enter new row: \"");

    EXPECT_NONFATAL_FAILURE(
        {
            ScriptedDialogs dialogs;
            dialogs.expect(MessageRequest::information("Saved."), DialogAnswer::Yes);
            EXPECT_EQ(dialogs.showMessage(MessageRequest::information("Saved.")), DialogAnswer::Ok);
        },
        "does not fit the buttons");
}

} // namespace
} // namespace penmoor
