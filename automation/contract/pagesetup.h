#pragma once

#include <optional>
#include <string>

namespace xl {

// Page setup of a worksheet. Margins are in points.
class PageSetup {
public:
    virtual ~PageSetup() = default;

    // A1 address of the print area, such as "A1:P53"; empty for none.
    virtual std::string PrintArea() const = 0;
    virtual void setPrintArea(const std::string& address) = 0;

    virtual double LeftMargin() const = 0;
    virtual void setLeftMargin(double points) = 0;
    virtual double RightMargin() const = 0;
    virtual void setRightMargin(double points) = 0;
    virtual double TopMargin() const = 0;
    virtual void setTopMargin(double points) = 0;
    virtual double BottomMargin() const = 0;
    virtual void setBottomMargin(double points) = 0;
    virtual double HeaderMargin() const = 0;
    virtual void setHeaderMargin(double points) = 0;
    virtual double FooterMargin() const = 0;
    virtual void setFooterMargin(double points) = 0;

    // kPrintNoComments, kPrintCommentsInPlace or kPrintCommentsAtEnd
    virtual int PrintComments() const = 0;
    virtual void setPrintComments(int mode) = 0;
    // kOrientationPortrait or kOrientationLandscape
    virtual int Orientation() const = 0;
    virtual void setOrientation(int orientation) = 0;
    // kPaperA4, kPaperLetter, ...
    virtual int PaperSize() const = 0;
    virtual void setPaperSize(int paperSize) = 0;

    // Scaling in percent (10 to 400), or no value for False: the print area is then fitted
    // to FitToPagesWide by FitToPagesTall pages.
    virtual std::optional<int> Zoom() const = 0;
    virtual void setZoom(std::optional<int> percent) = 0;
    virtual int FitToPagesWide() const = 0;
    virtual void setFitToPagesWide(int pages) = 0;
    virtual int FitToPagesTall() const = 0;
    virtual void setFitToPagesTall(int pages) = 0;
};

} // namespace xl
