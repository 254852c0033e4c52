#include "report/twelvemonthcashflow.h"

#include "report/itemrows.h"
#include "report/periodcolumns.h"
#include "report/sheetheader.h"
#include "report/sheetstyling.h"
#include "report/sheetwriter.h"

namespace penmoor {

TwelveMonthCashFlow::TwelveMonthCashFlow(xl::Application& application, Options& options, const MainWindowView& view)
    : m_application(application)
    , m_options(options)
    , m_view(view)
{
}

void TwelveMonthCashFlow::WriteCashFlowSheet()
{
    SheetWriter sheet(m_application);

    const PeriodSettings periods = PeriodSettings::read(m_view);
    for (int position = 1; position <= m_options.count(); ++position) {
        m_options.setIncluded(position, true);
    }
    copyPalette(m_application, m_options.palette());
    resetSheet(sheet);
    const int lastColumn = periods.lastColumn();
    setSheetSizes(sheet, lastColumn);

    writeTitleBlock(sheet, lastColumn, m_view.text(TextBox::Text1));
    writePeriodHeader(sheet, periods, lastColumn);

    const int rowCount = numberItemRows(m_options);
    const std::string printArea = drawTableFrame(sheet, lastColumn, rowCount);
    writeItemRows(sheet, m_options, lastColumn);

    sheet.SetupPage(printArea);
    sheet.Select("C5");
}

} // namespace penmoor
