#pragma once

#include "automation/contract/constants.h"
#include "spreadsheet/builtin/picturerenderer.h"
#include "spreadsheet/workbook/workbook.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace penmoor::engine {

// An open workbook of the built-in application. Closing it drops the model; handles that
// still point at it then raise an error instead of dangling.
struct Document {
    std::string name; // "Book1", ...
    std::unique_ptr<Workbook> model;
};

// Everything one instance of the built-in application holds. Every object handed out shares
// it, so an object used after Quit finds the application gone.
struct ApplicationState {
    bool running = true;
    bool visible = false;
    bool screenUpdating = true;
    bool displayAlerts = true;
    bool enableEvents = true;
    int enableCancelKey = xl::kCancelKeyInterrupt;
    int cursor = xl::kCursorDefault;
    std::vector<std::shared_ptr<Document>> documents; // the open workbooks, in order
    std::shared_ptr<Document> activeDocument;
    int nextBookNumber = 1;
    std::shared_ptr<PictureRenderer> renderer;

    // Raises xl::Error after Quit.
    void checkRunning() const;
};

// A workbook as the objects of the contract refer to it.
class WorkbookHandle {
public:
    WorkbookHandle(std::shared_ptr<ApplicationState> application, std::shared_ptr<Document> document);

    // The model; raises xl::Error when the workbook was closed or the application quit.
    Workbook& workbook() const;
    const std::string& name() const { return m_document->name; }
    const std::shared_ptr<ApplicationState>& application() const { return m_application; }
    const std::shared_ptr<Document>& document() const { return m_document; }

private:
    std::shared_ptr<ApplicationState> m_application;
    std::shared_ptr<Document> m_document;
};

// A sheet as the objects of the contract refer to it: by its id, so that deleting it is
// noticed.
class SheetHandle {
public:
    SheetHandle(WorkbookHandle workbook, std::uint64_t sheetId);

    Workbook& workbook() const { return m_workbook.workbook(); }
    // Raises xl::Error when the sheet was deleted (or its workbook closed).
    Sheet& sheet() const;
    int index() const;
    const WorkbookHandle& workbookHandle() const { return m_workbook; }
    // Whether this is the active sheet of the application's active workbook.
    bool isActive() const;

private:
    WorkbookHandle m_workbook;
    std::uint64_t m_sheetId = 0;
};

// The handles of the active workbook and of its active sheet; raise xl::Error when no
// workbook is open.
WorkbookHandle activeWorkbook(const std::shared_ptr<ApplicationState>& application);
SheetHandle activeSheet(const std::shared_ptr<ApplicationState>& application);

} // namespace penmoor::engine
