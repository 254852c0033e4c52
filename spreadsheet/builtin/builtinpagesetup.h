#pragma once

#include "automation/contract/pagesetup.h"
#include "spreadsheet/builtin/session.h"

namespace penmoor::engine {

// A sheet's page setup; margins travel in points and are kept in inches.
class BuiltinPageSetup : public xl::PageSetup {
public:
    explicit BuiltinPageSetup(SheetHandle sheet);

    std::string PrintArea() const override;
    void setPrintArea(const std::string& address) override;

    double LeftMargin() const override;
    void setLeftMargin(double points) override;
    double RightMargin() const override;
    void setRightMargin(double points) override;
    double TopMargin() const override;
    void setTopMargin(double points) override;
    double BottomMargin() const override;
    void setBottomMargin(double points) override;
    double HeaderMargin() const override;
    void setHeaderMargin(double points) override;
    double FooterMargin() const override;
    void setFooterMargin(double points) override;

    int PrintComments() const override;
    void setPrintComments(int mode) override;
    int Orientation() const override;
    void setOrientation(int orientation) override;
    int PaperSize() const override;
    void setPaperSize(int paperSize) override;

    std::optional<int> Zoom() const override;
    void setZoom(std::optional<int> percent) override;
    int FitToPagesWide() const override;
    void setFitToPagesWide(int pages) override;
    int FitToPagesTall() const override;
    void setFitToPagesTall(int pages) override;

private:
    engine::PageSetup& setup() const { return m_sheet.sheet().pageSetup(); }
    double margin(double engine::PageSetup::*field) const;
    void setMargin(double engine::PageSetup::*field, double points, const char* name);

    SheetHandle m_sheet;
};

} // namespace penmoor::engine
