#include "tests/support/scripteddialogs.h"

#include "shell/errorreport.h"

#include <type_traits>
#include <utility>

#include <gtest/gtest.h>

namespace penmoor::testing {

namespace {

// Line breaks and other control characters made visible, so two texts can be told apart.
std::string visible(std::string_view text)
{
    std::string out = "\"";
    for (const char c : text) {
        switch (c) {
        case '\r':
            out += "\\r";
            break;
        case '\n':
            out += "\\n";
            break;
        case '"':
            out += "\\\"";
            break;
        default:
            out += c;
        }
    }
    return out + "\"";
}

std::string_view nameOf(MessageButtons buttons)
{
    return buttons == MessageButtons::Ok ? "OK" : "Yes/No";
}

std::string_view nameOf(MessageIcon icon)
{
    switch (icon) {
    case MessageIcon::None:
        return "no icon";
    case MessageIcon::Information:
        return "information";
    case MessageIcon::Question:
        return "question";
    case MessageIcon::Exclamation:
        return "exclamation";
    }
    return "?";
}

std::string_view nameOf(DialogAnswer answer)
{
    switch (answer) {
    case DialogAnswer::Ok:
        return "OK";
    case DialogAnswer::Yes:
        return "Yes";
    case DialogAnswer::No:
        return "No";
    }
    return "?";
}

// The prompt as the user sees it: a box without a title shows the application title.
Prompt asShown(Prompt prompt)
{
    std::visit(
        [](auto& request) {
            if constexpr (!std::is_same_v<std::decay_t<decltype(request)>, SaveFileRequest>) {
                request.title = std::string(shownTitle(request.title));
            }
        },
        prompt);
    return prompt;
}

// What an unscripted box gets: the answer that changes nothing.
DialogAnswer harmlessAnswer(const MessageRequest& request)
{
    return request.buttons == MessageButtons::YesNo ? DialogAnswer::No : DialogAnswer::Ok;
}

} // namespace

std::string describe(const Prompt& prompt)
{
    struct Describer {
        std::string operator()(const MessageRequest& r) const
        {
            return "message box " + visible(r.text) + ", " + std::string(nameOf(r.buttons)) + ", "
                + std::string(nameOf(r.icon)) + ", title " + visible(r.title) + ", default "
                + std::string(nameOf(r.defaultButton));
        }
        std::string operator()(const InputRequest& r) const
        {
            return "input box " + visible(r.prompt) + ", title " + visible(r.title) + ", default text "
                + visible(r.defaultText);
        }
        std::string operator()(const SaveFileRequest& r) const
        {
            return "save dialog, title " + visible(r.title) + ", filter " + visible(r.filter);
        }
    };
    return std::visit(Describer {}, prompt);
}

ScriptedDialogs::~ScriptedDialogs()
{
    for (const Expectation& expectation : m_script) {
        ADD_FAILURE() << "Expected prompt never shown: " << describe(expectation.prompt);
    }
}

ScriptedDialogs& ScriptedDialogs::expect(const MessageRequest& request, DialogAnswer answer)
{
    m_script.push_back({ asShown(request), answer });
    return *this;
}

ScriptedDialogs& ScriptedDialogs::expect(const InputRequest& request, std::string answer)
{
    m_script.push_back({ asShown(request), std::move(answer) });
    return *this;
}

ScriptedDialogs& ScriptedDialogs::expect(const SaveFileRequest& request, std::string answer)
{
    m_script.push_back({ request, std::move(answer) });
    return *this;
}

ScriptedDialogs& ScriptedDialogs::expectErrorReport(std::string_view description, std::string_view location, int line)
{
    return expect(errorReportRequest(description, location, line));
}

std::optional<ScriptedDialogs::Expectation> ScriptedDialogs::take(Prompt shown)
{
    shown = asShown(std::move(shown));
    m_log.push_back(shown);
    if (m_script.empty()) {
        ADD_FAILURE() << "Unexpected prompt: " << describe(shown);
        return std::nullopt;
    }
    if (!(m_script.front().prompt == shown)) {
        ADD_FAILURE() << "Unexpected prompt: " << describe(shown)
                      << "\n  expected: " << describe(m_script.front().prompt);
        return std::nullopt;
    }
    Expectation next = std::move(m_script.front());
    m_script.pop_front();
    return next;
}

DialogAnswer ScriptedDialogs::showMessage(const MessageRequest& request)
{
    const auto expectation = take(request);
    if (!expectation) {
        return harmlessAnswer(request);
    }
    const auto* answer = std::get_if<DialogAnswer>(&expectation->answer);
    const bool fits = answer
        && (request.buttons == MessageButtons::YesNo ? *answer != DialogAnswer::Ok : *answer == DialogAnswer::Ok);
    if (!fits) {
        ADD_FAILURE() << "Scripted answer does not fit the buttons of " << describe(request);
        return harmlessAnswer(request);
    }
    return *answer;
}

std::string ScriptedDialogs::askText(const InputRequest& request)
{
    const auto expectation = take(request);
    return expectation ? std::get<std::string>(expectation->answer) : std::string();
}

std::string ScriptedDialogs::askSavePath(const SaveFileRequest& request)
{
    const auto expectation = take(request);
    return expectation ? std::get<std::string>(expectation->answer) : std::string();
}

} // namespace penmoor::testing
