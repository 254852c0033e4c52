#pragma once

#include "model/mainwindowview.h"
#include "shell/dialogs.h"

namespace penmoor {

class ItemEditor;

// "Clear/Reset Data": empties the company, year and week boxes, then offers to restore the
// default item list and options (the "Restore Default Template Items" question). Answered No,
// the boxes stay empty and the list stays as it is.
void ClearResetData(MainWindowView& view, ItemEditor& editor, Dialogs& dialogs);

// "Load Sample/Example Data": a sample company planned By Month over 2013. The other boxes
// and the item list stay as they are.
void LoadSampleData(MainWindowView& view, Dialogs& dialogs);

} // namespace penmoor
