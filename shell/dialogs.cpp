#include "shell/dialogs.h"

#include <utility>

namespace penmoor {

MessageRequest MessageRequest::question(std::string text)
{
    return { std::move(text), MessageButtons::YesNo, MessageIcon::Question, "Question", DialogAnswer::No };
}

MessageRequest MessageRequest::information(std::string text)
{
    return { std::move(text), MessageButtons::Ok, MessageIcon::Information, "Information", DialogAnswer::Ok };
}

MessageRequest MessageRequest::inputProblem(std::string text)
{
    return { std::move(text), MessageButtons::Ok, MessageIcon::Information, "Error", DialogAnswer::Ok };
}

MessageRequest MessageRequest::plain(std::string text, MessageButtons buttons)
{
    const DialogAnswer first = buttons == MessageButtons::YesNo ? DialogAnswer::Yes : DialogAnswer::Ok;
    return { std::move(text), buttons, MessageIcon::None, std::string(kApplicationTitle), first };
}

std::string_view shownTitle(std::string_view title)
{
    return title.empty() ? kApplicationTitle : title;
}

} // namespace penmoor
