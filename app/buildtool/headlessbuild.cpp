#include "app/buildtool/headlessbuild.h"

#include "app/buildtool/outputpaths.h"
#include "automation/excel1.h"
#include "automation/statements.h"
#include "automation/templatebuild.h"
#include "model/memorysettingsstore.h"
#include "model/memorywindowview.h"
#include "model/options.h"
#include "model/settingskeys.h"
#include "model/storedvalue.h"
#include "shell/filereplace.h"
#include "shell/fileutils.h"
#include "shell/unitrandom.h"
#include "shell/utf8path.h"

#include <stdexcept>

namespace penmoor {

namespace {

namespace fs = std::filesystem;

// A file of the build's own that is deleted unless it was moved to its final name.
class StagedFile {
public:
    StagedFile() = default;
    StagedFile(const StagedFile&) = delete;
    StagedFile& operator=(const StagedFile&) = delete;
    ~StagedFile() { DeleteFile(m_path); }

    void adopt(fs::path path) { m_path = std::move(path); }
    const fs::path& path() const { return m_path; }

    // Moves the file over target in one step; it takes the permissions a file there would have.
    void place(const fs::path& target)
    {
        giveAccessOf(target, m_path);
        if (const std::error_code error = moveFileOver(m_path, target)) {
            throw std::runtime_error("Could not write \"" + utf8Text(target) + "\": " + error.message() + ".");
        }
        m_path.clear();
    }

private:
    fs::path m_path;
};

// The item list goes in through the settings store, the way the program restores a list
// from its last run.
void storeItemList(SettingsStore& store, const std::vector<std::string>& names)
{
    store.write(kRowsKey, std::to_string(names.size()));
    store.write(kSavedKey, booleanText(true));
    for (std::size_t index = 0; index < names.size(); ++index) {
        store.write(fieldKey(static_cast<int>(index + 1)), names[index]);
    }
}

void putOptions(MainWindowView& view, const BuildRequest& request)
{
    const std::string first = std::to_string(request.firstYear);
    const std::string last = std::to_string(request.lastYear);
    view.setText(TextBox::Text1, request.company);
    view.setText(TextBox::Text2, first);
    view.setText(TextBox::Text3, last);
    view.setText(TextBox::Text6, first);
    view.setText(TextBox::Text7, last);
    view.setText(TextBox::Text4, std::to_string(request.weeks));
    switch (request.mode) {
    case PeriodMode::ByYear:
        view.setOptionOn(OptionButton::Option1, true);
        break;
    case PeriodMode::ByMonth:
        view.setOptionOn(OptionButton::Option3, true);
        break;
    case PeriodMode::ByWeek:
        view.setOptionOn(OptionButton::Option2, true);
        break;
    }
}

// The picture of the saved workbook, reopened in a second instance as a build in the window
// does it.
xl::Picture pictureOfSavedWorkbook(xl::ApplicationFactory& spreadsheets, const fs::path& workbookFile)
{
    const std::unique_ptr<xl::Application> second = OpenWorkbookInNewInstance(spreadsheets, workbookFile);
    const std::unique_ptr<xl::Workbooks> workbooks = second->Workbooks();
    const std::unique_ptr<xl::Workbook> reopened = workbooks->Item(workbooks->count());
    const std::optional<xl::Picture> picture = SheetPicture(*reopened);
    second->setDisplayAlerts(false);
    reopened->Close();
    second->Quit();
    if (!picture) {
        throw std::runtime_error("The sheet has nothing below its first row, so there is no picture of it.");
    }
    return *picture;
}

} // namespace

void runHeadlessBuild(
    const BuildRequest& request, xl::ApplicationFactory& spreadsheets, const PngEncoder& encodePng, int currentYear)
{
    MemorySettingsStore store;
    if (!request.items.empty()) {
        storeItemList(store, request.items);
    }
    MemoryWindowView view;
    Options options(store, view, [currentYear] { return currentYear; });
    options.LoadOptions(LoadMode::FromStore);
    putOptions(view, request);

    const BuildSetup setup { spreadsheets, options, view, folderOf(request.output), seededUnitRandom() };
    SharedApplication shared;
    TemplateBuild build(setup, shared);
    StagedFile workbook;
    FirstFailureStops statements;
    try {
        build.writeTemporaryWorkbook(statements);
    } catch (...) {
        workbook.adopt(build.temporaryWorkbook());
        throw;
    }
    workbook.adopt(build.temporaryWorkbook());

    if (request.picture) {
        const std::vector<std::uint8_t> png = encodePng(pictureOfSavedWorkbook(spreadsheets, workbook.path()));
        if (const std::error_code error = replaceFileContents(*request.picture, png)) {
            throw std::runtime_error(
                "Could not write \"" + utf8Text(*request.picture) + "\": " + error.message() + ".");
        }
    }
    try {
        workbook.place(request.output);
    } catch (...) {
        // A picture without its workbook is no result.
        if (request.picture) {
            DeleteFile(*request.picture);
        }
        throw;
    }
}

} // namespace penmoor
