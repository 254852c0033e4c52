// Edits of the largest item list through the main window: the editor's checks, the model's
// recomputation of every derived field and the replacement of every List1 entry in the real
// list widget, repainted on screen.
#include "model/memorysettingsstore.h"
#include "model/options.h"
#include "spreadsheet/builtin/builtinapplication.h"
#include "ui/main/form1.h"

#include <filesystem>
#include <string>

#include <QApplication>

#include <benchmark/benchmark.h>

namespace penmoor {
namespace {

// Answers every input box with the next name and every question with Yes.
class CannedDialogs : public Dialogs {
public:
    DialogAnswer showMessage(const MessageRequest& request) override
    {
        return request.buttons == MessageButtons::YesNo ? DialogAnswer::Yes : DialogAnswer::Ok;
    }
    std::string askText(const InputRequest&) override { return "Edited line " + std::to_string(++m_count); }
    std::string askSavePath(const SaveFileRequest&) override { return {}; }

private:
    int m_count = 0;
};

struct LargeWindow {
    explicit LargeWindow(int size)
    {
        store.write("Field1", "Cash on Hand (beginning of month)");
        for (int position = 2; position <= size; ++position) {
            store.write("Field" + std::to_string(position), "Expense line " + std::to_string(position));
        }
        store.write("System Value - Rows", std::to_string(size));
        store.write("System Value - Saved", "True");
        store.write("ShowAgain", "1");
        form.load();
        form.show();
        form.setSelectedListIndex(size / 2);
        QApplication::processEvents();
    }

    MemorySettingsStore store;
    CannedDialogs dialogs;
    engine::BuiltinApplicationFactory spreadsheets;
    Form1 form { { store, dialogs, spreadsheets, std::filesystem::temp_directory_path(), [] { return 2031; },
        [] { return 0.5; }, [](std::string_view) {}, std::nullopt } };
    ItemEditor editor { form.options(), form, form, dialogs };
};

// One insertion below the middle of a list one short of full, then its deletion: two whole
// edits, each ending with the window repainted.
void BM_InsertThenDeleteInWindow(benchmark::State& state)
{
    LargeWindow window(kMaximumItemCount - 1);
    for (auto _ : state) {
        window.editor.PushButton2_Click(ItemEditor::InsertNewBelowSelected);
        QApplication::processEvents();
        window.editor.PushButton2_Click(ItemEditor::DeleteSelected);
        QApplication::processEvents();
    }
}

void BM_RenameInWindow(benchmark::State& state)
{
    LargeWindow window(kMaximumItemCount);
    for (auto _ : state) {
        window.editor.PushButton2_Click(ItemEditor::RenameSelected);
        QApplication::processEvents();
    }
}

BENCHMARK(BM_InsertThenDeleteInWindow)->Unit(benchmark::kMillisecond);
BENCHMARK(BM_RenameInWindow)->Unit(benchmark::kMillisecond);

} // namespace
} // namespace penmoor

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) {
        qputenv("QT_QPA_PLATFORM", "offscreen");
    }
    QApplication application(argc, argv);
    benchmark::Initialize(&argc, argv);
    benchmark::RunSpecifiedBenchmarks();
    benchmark::Shutdown();
    return 0;
}
