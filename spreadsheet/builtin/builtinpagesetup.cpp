#include "spreadsheet/builtin/builtinpagesetup.h"

#include "automation/contract/constants.h"
#include "automation/contract/error.h"
#include "spreadsheet/builtin/contractvalues.h"
#include "spreadsheet/formula/valuetext.h"

#include <cmath>

namespace penmoor::engine {

namespace {

constexpr double kMaxMarginInches = 49.0; // larger than any paper
constexpr int kMinZoom = 10;
constexpr int kMaxZoom = 400;
constexpr int kMaxPages = 32767;
constexpr int kMaxPaperSize = 255;

} // namespace

BuiltinPageSetup::BuiltinPageSetup(SheetHandle sheet)
    : m_sheet(std::move(sheet))
{
}

std::string BuiltinPageSetup::PrintArea() const
{
    const std::optional<Region>& area = setup().printArea;
    return area ? formatAddress(*area) : std::string();
}

void BuiltinPageSetup::setPrintArea(const std::string& address)
{
    engine::PageSetup& page = setup();
    if (address.empty())
        page.printArea.reset();
    else
        page.printArea = parseAddress(address);
}

double BuiltinPageSetup::margin(double engine::PageSetup::*field) const
{
    return setup().*field * xl::kPointsPerInch;
}

void BuiltinPageSetup::setMargin(double engine::PageSetup::*field, double points, const char* name)
{
    const double inches = points / xl::kPointsPerInch;
    if (!std::isfinite(points) || inches < 0.0 || inches > kMaxMarginInches)
        throw xl::Error(std::string("The ") + name + " margin of " + numberText(points)
            + " points is not valid: it must be 0 to 3528 points.");
    setup().*field = inches;
}

double BuiltinPageSetup::LeftMargin() const
{
    return margin(&engine::PageSetup::leftMarginInches);
}
void BuiltinPageSetup::setLeftMargin(double points)
{
    setMargin(&engine::PageSetup::leftMarginInches, points, "left");
}
double BuiltinPageSetup::RightMargin() const
{
    return margin(&engine::PageSetup::rightMarginInches);
}
void BuiltinPageSetup::setRightMargin(double points)
{
    setMargin(&engine::PageSetup::rightMarginInches, points, "right");
}
double BuiltinPageSetup::TopMargin() const
{
    return margin(&engine::PageSetup::topMarginInches);
}
void BuiltinPageSetup::setTopMargin(double points)
{
    setMargin(&engine::PageSetup::topMarginInches, points, "top");
}
double BuiltinPageSetup::BottomMargin() const
{
    return margin(&engine::PageSetup::bottomMarginInches);
}
void BuiltinPageSetup::setBottomMargin(double points)
{
    setMargin(&engine::PageSetup::bottomMarginInches, points, "bottom");
}
double BuiltinPageSetup::HeaderMargin() const
{
    return margin(&engine::PageSetup::headerMarginInches);
}
void BuiltinPageSetup::setHeaderMargin(double points)
{
    setMargin(&engine::PageSetup::headerMarginInches, points, "header");
}
double BuiltinPageSetup::FooterMargin() const
{
    return margin(&engine::PageSetup::footerMarginInches);
}
void BuiltinPageSetup::setFooterMargin(double points)
{
    setMargin(&engine::PageSetup::footerMarginInches, points, "footer");
}

int BuiltinPageSetup::PrintComments() const
{
    return toContract(setup().comments);
}
void BuiltinPageSetup::setPrintComments(int mode)
{
    setup().comments = commentPrintingFrom(mode);
}
int BuiltinPageSetup::Orientation() const
{
    return toContract(setup().orientation);
}
void BuiltinPageSetup::setOrientation(int orientation)
{
    setup().orientation = orientationFrom(orientation);
}
int BuiltinPageSetup::PaperSize() const
{
    return setup().paperSize;
}

void BuiltinPageSetup::setPaperSize(int paperSize)
{
    if (paperSize < 1 || paperSize > kMaxPaperSize)
        throw xl::Error("The paper size " + std::to_string(paperSize) + " is not a paper size code (1 to 255).");
    setup().paperSize = paperSize;
}

std::optional<int> BuiltinPageSetup::Zoom() const
{
    return setup().zoomPercent;
}

void BuiltinPageSetup::setZoom(std::optional<int> percent)
{
    if (percent && (*percent < kMinZoom || *percent > kMaxZoom))
        throw xl::Error("The zoom of " + std::to_string(*percent) + "% is not valid: it must be 10 to 400 percent.");
    setup().zoomPercent = percent;
}

int BuiltinPageSetup::FitToPagesWide() const
{
    return setup().fitToPagesWide;
}

void BuiltinPageSetup::setFitToPagesWide(int pages)
{
    if (pages < 0 || pages > kMaxPages)
        throw xl::Error("Fitting to " + std::to_string(pages) + " pages wide is not valid: it must be 0 to 32767.");
    setup().fitToPagesWide = pages;
}

int BuiltinPageSetup::FitToPagesTall() const
{
    return setup().fitToPagesTall;
}

void BuiltinPageSetup::setFitToPagesTall(int pages)
{
    if (pages < 0 || pages > kMaxPages)
        throw xl::Error("Fitting to " + std::to_string(pages) + " pages tall is not valid: it must be 0 to 32767.");
    setup().fitToPagesTall = pages;
}

} // namespace penmoor::engine
