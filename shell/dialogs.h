#pragma once

#include <string>
#include <string_view>

namespace penmoor {

// The title every box shows when it is given none of its own.
inline constexpr std::string_view kApplicationTitle = "Penmoor";

enum class MessageButtons { Ok, YesNo };

enum class MessageIcon { None, Information, Question, Exclamation };

// The user's answer to a message box, with the values the program's stored logic compares
// against (the Yes of a Yes/No box is 6).
enum class DialogAnswer { Ok = 1, Yes = 6, No = 7 };

// One message box. Texts are UTF-8; lines are joined by "\r\n" (the error report also uses
// lone "\r"), and the implementation shows every one of them as a line break.
struct MessageRequest {
    std::string text;
    MessageButtons buttons = MessageButtons::Ok;
    MessageIcon icon = MessageIcon::None;
    std::string title; // empty: the application title
    DialogAnswer defaultButton = DialogAnswer::Ok;

    // Yes and No with the question icon, No as the default, titled "Question".
    static MessageRequest question(std::string text);
    // A refusal or a confirmation: OK with the information icon, titled "Information".
    static MessageRequest information(std::string text);
    // A corrected input value: OK with the information icon, titled "Error".
    static MessageRequest inputProblem(std::string text);
    // No icon and the application title; a Yes/No box defaults to its first button, Yes.
    static MessageRequest plain(std::string text, MessageButtons buttons = MessageButtons::Ok);

    friend bool operator==(const MessageRequest&, const MessageRequest&) = default;
};

// A one-line text entry with OK and Cancel.
struct InputRequest {
    std::string prompt;
    std::string title; // empty: the application title
    std::string defaultText;

    friend bool operator==(const InputRequest&, const InputRequest&) = default;
};

// The save-file dialog. The filter is written as description|pattern pairs, each part
// followed by "|", e.g. "Excel Files (*.xls)|*.xls|"; several patterns of one pair are
// separated by ";". The dialog asks nothing about overwriting and adds no extension.
struct SaveFileRequest {
    std::string title;
    std::string filter;

    friend bool operator==(const SaveFileRequest&, const SaveFileRequest&) = default;
};

// The title a box shows: its own, or the application title when it has none.
std::string_view shownTitle(std::string_view title);

// Everything that talks to the user goes through this one interface, so window and build
// logic runs in tests with scripted answers. All three calls are modal.
class Dialogs {
public:
    virtual ~Dialogs() = default;

    virtual DialogAnswer showMessage(const MessageRequest& request) = 0;
    // The typed text, or "" when the user cancels.
    virtual std::string askText(const InputRequest& request) = 0;
    // The chosen path exactly as the user gave it, or "" when the user cancels.
    virtual std::string askSavePath(const SaveFileRequest& request) = 0;
};

} // namespace penmoor
