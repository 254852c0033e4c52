#include "automation/templatebuild.h"

#include "automation/contract/constants.h"
#include "automation/excel1.h"
#include "automation/existing.h"
#include "automation/picturefile.h"
#include "automation/temporaryworkbook.h"
#include "report/twelvemonthcashflow.h"
#include "shell/fileutils.h"
#include "shell/utf8path.h"

namespace penmoor {

namespace {

constexpr char kSheetName[] = "CashFlow";
constexpr char kPictureFileName[] = "temp.bmp";

const std::filesystem::path& claimed(const std::filesystem::path& temporaryWorkbook)
{
    return existing(temporaryWorkbook, "temporary workbook");
}

} // namespace

TemplateBuild::TemplateBuild(const BuildSetup& setup, SharedApplication& shared)
    : m_setup(setup)
    , m_shared(shared)
{
}

void TemplateBuild::writeTemporaryWorkbook(StatementRunner& statements)
{
    const auto app = [this]() -> xl::Application& { return m_shared.application(); };

    statements.run(100, [&] { m_setup.options.TakeListMarks(); });
    statements.run(102, [&] { m_shared.StartSpreadsheet(m_setup.spreadsheets); });

    // Hidden and quiet while the sheet is written.
    statements.run(104, [&] { app().setVisible(false); });
    statements.run(106, [&] { app().setScreenUpdating(false); });
    statements.run(108, [&] { app().setDisplayAlerts(false); });
    statements.run(110, [&] { app().setEnableEvents(false); });
    statements.run(112, [&] { app().setEnableCancelKey(xl::kCancelKeyDisabled); });
    statements.run(114, [&] { app().setCursor(xl::kCursorWait); });

    statements.run(116, [&] { m_buildWorkbook = app().Workbooks()->Add(); });
    // Down to one sheet, always deleting the second one.
    int sheetCount = 0;
    statements.run(118, [&] { sheetCount = app().Sheets()->count(); });
    const int surplus = sheetCount == 1 ? 0 : sheetCount - 1;
    for (int deletion = 0; deletion < surplus; ++deletion) {
        statements.run(120, [&] { app().Sheets()->Item(2)->Delete(); });
    }
    statements.run(122, [&] {
        const std::unique_ptr<xl::Sheets> sheets = app().Sheets();
        sheets->Item(sheets->count())->setName(kSheetName);
    });

    statements.run(124, [&] { TwelveMonthCashFlow(app(), m_setup.options, m_setup.boxes).WriteCashFlowSheet(); });
    statements.run(126, [&] { app().Range("C5")->Select(); });
    statements.run(128, [&] { app().Sheets()->Item(1)->Select(); });

    // The switches back as a user finds them, before the workbook is saved.
    statements.run(130, [&] { app().setCursor(xl::kCursorDefault); });
    statements.run(132, [&] { app().setScreenUpdating(true); });
    statements.run(134, [&] { app().setDisplayAlerts(true); });
    statements.run(136, [&] { app().setEnableEvents(true); });
    statements.run(138, [&] { app().setEnableCancelKey(xl::kCancelKeyInterrupt); });

    statements.run(140, [&] { m_temporaryWorkbook = claimTemporaryWorkbook(m_setup.temporaryFolder, m_setup.random); });
    const bool saved = statements.run(
        142, [&] { existing(m_buildWorkbook, "build workbook").SaveAs(utf8Text(claimed(m_temporaryWorkbook))); });
    if (!saved && !m_temporaryWorkbook.empty()) {
        // An unfilled claim must not pass for a workbook: saving the results from the preview
        // would copy the empty file and report success.
        DeleteFile(m_temporaryWorkbook);
    }
    statements.run(144, [&] { app().setDisplayAlerts(false); });
    statements.run(146, [&] { existing(m_buildWorkbook, "build workbook").Close(); });
    statements.run(148, [&] { app().Quit(); });
    statements.run(150, [&] { m_shared.ReleaseSpreadsheet(); });
}

void TemplateBuild::showInPreview(StatementRunner& statements, MainWindow& mainWindow, PreviewWindow& preview)
{
    std::unique_ptr<xl::Application> second;
    std::unique_ptr<xl::Workbook> reopened;
    std::optional<PrivateFolder> pictureFolder;
    std::filesystem::path pictureFile;
    const auto secondApp = [&]() -> xl::Application& { return existing(second, "second spreadsheet application"); };

    statements.run(
        152, [&] { second = OpenWorkbookInNewInstance(m_setup.spreadsheets, claimed(m_temporaryWorkbook)); });
    statements.run(154, [&] { mainWindow.setMousePointer(MousePointer::Hourglass); });
    statements.run(156, [&] {
        const std::unique_ptr<xl::Workbooks> workbooks = secondApp().Workbooks();
        reopened = workbooks->Item(workbooks->count());
    });
    statements.run(158, [&] {
        pictureFolder.emplace(m_setup.temporaryFolder, m_setup.random);
        pictureFile = pictureFolder->path() / kPictureFileName;
    });
    statements.run(160, [&] {
        SaveSheetPicture(existing(reopened, "reopened workbook"), existing(pictureFile, "sheet picture file"));
    });
    statements.run(162, [&] { secondApp().setDisplayAlerts(false); });
    statements.run(164, [&] { existing(reopened, "reopened workbook").Close(); });
    statements.run(166, [&] { secondApp().Quit(); });
    statements.run(168, [&] { mainWindow.setMousePointer(MousePointer::Default); });

    statements.run(170, [&] { preview.setPicture(loadPictureFile(existing(pictureFile, "sheet picture file"))); });
    statements.run(172, [&] { preview.setTempWorkbookPath(m_temporaryWorkbook); });
    statements.run(174, [&] { preview.show(); });
    statements.run(176, [&] { mainWindow.hide(); });
    // The picture is in the preview now; its file and the private folder go. The temporary
    // workbook stays: it belongs to the preview window.
    statements.run(178, [&] { DeleteFile(pictureFile); });
}

} // namespace penmoor
