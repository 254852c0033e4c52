#include "model/mainwindowview.h"

namespace penmoor {

std::string_view controlName(TextBox box)
{
    switch (box) {
    case TextBox::Text1:
        return "Text1";
    case TextBox::Text2:
        return "Text2";
    case TextBox::Text3:
        return "Text3";
    case TextBox::Text4:
        return "Text4";
    case TextBox::Text6:
        return "Text6";
    case TextBox::Text7:
        return "Text7";
    }
    return {};
}

std::string_view controlName(OptionButton button)
{
    switch (button) {
    case OptionButton::Option1:
        return "Option1";
    case OptionButton::Option2:
        return "Option2";
    case OptionButton::Option3:
        return "Option3";
    }
    return {};
}

PeriodMode periodMode(const MainWindowView& view)
{
    if (view.isOptionOn(OptionButton::Option1)) {
        return PeriodMode::ByYear;
    }
    if (view.isOptionOn(OptionButton::Option3)) {
        return PeriodMode::ByMonth;
    }
    return PeriodMode::ByWeek;
}

} // namespace penmoor
