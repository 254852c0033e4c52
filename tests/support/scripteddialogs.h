#pragma once

#include "shell/dialogs.h"

#include <deque>
#include <optional>
#include <string>
#include <string_view>
#include <variant>
#include <vector>

namespace penmoor::testing {

// One prompt as the user saw it (titles resolved to what the box shows).
using Prompt = std::variant<MessageRequest, InputRequest, SaveFileRequest>;

// Dialogs with scripted answers. A test lists the prompts it expects, in order, each with
// its answer; every prompt shown is logged. A prompt that differs from the next expected
// one, or comes when none is expected, fails the test (and gets a harmless answer: No, OK,
// or Cancel); an expected prompt still unshown when the object dies fails it too.
//
//     ScriptedDialogs dialogs;
//     dialogs.expect(MessageRequest::question("Do you really want restore default settings ?"),
//                    DialogAnswer::Yes);
//     dialogs.expect(MessageRequest::information("Default settings restored."));
class ScriptedDialogs : public Dialogs {
public:
    ScriptedDialogs() = default;
    ScriptedDialogs(const ScriptedDialogs&) = delete;
    ScriptedDialogs& operator=(const ScriptedDialogs&) = delete;
    ~ScriptedDialogs() override;

    ScriptedDialogs& expect(const MessageRequest& request, DialogAnswer answer = DialogAnswer::Ok);
    ScriptedDialogs& expect(const InputRequest& request, std::string answer);
    ScriptedDialogs& expect(const SaveFileRequest& request, std::string answer);
    // The error report of a reporting procedure.
    ScriptedDialogs& expectErrorReport(std::string_view description, std::string_view location, int line);

    DialogAnswer showMessage(const MessageRequest& request) override;
    std::string askText(const InputRequest& request) override;
    std::string askSavePath(const SaveFileRequest& request) override;

    // Every prompt shown so far, expected or not.
    const std::vector<Prompt>& log() const { return m_log; }
    // Expected prompts not shown yet.
    std::size_t pending() const { return m_script.size(); }

private:
    struct Expectation {
        Prompt prompt;
        std::variant<DialogAnswer, std::string> answer;
    };

    // Logs the prompt; the scripted answer when it is the expected one, else a failure.
    std::optional<Expectation> take(Prompt shown);

    std::deque<Expectation> m_script;
    std::vector<Prompt> m_log;
};

// A readable one-line description of a prompt, for failure messages.
std::string describe(const Prompt& prompt);

} // namespace penmoor::testing
