#include "ui/main/datacommands.h"

#include "shell/errorreport.h"
#include "ui/main/itemeditor.h"

namespace penmoor {

void ClearResetData(MainWindowView& view, ItemEditor& editor, Dialogs& dialogs)
{
    ReportingProcedure procedure(dialogs, errorlocation::Form1PushButton5Click);
    int line = 100;
    for (const TextBox box :
        { TextBox::Text1, TextBox::Text2, TextBox::Text3, TextBox::Text4, TextBox::Text6, TextBox::Text7 }) {
        procedure.step(line, [&] { view.setText(box, ""); });
        line += 2;
    }
    procedure.step(line, [&] { editor.PushButton3_Click(); });
}

void LoadSampleData(MainWindowView& view, Dialogs& dialogs)
{
    ReportingProcedure procedure(dialogs, errorlocation::Form1PushButton6Click);
    procedure.step(100, [&] { view.setText(TextBox::Text1, "Harlenby"); });
    procedure.step(102, [&] { view.setText(TextBox::Text6, "2013"); });
    procedure.step(104, [&] { view.setText(TextBox::Text7, "2013"); });
    procedure.step(106, [&] { view.setOptionOn(OptionButton::Option3, true); });
}

} // namespace penmoor
