#pragma once

namespace penmoor {

// Colour indexes of the sheet's look; they refer to the palette the builder copies into the
// workbook first, so they show the same colours whatever the workbook's own palette was.
inline constexpr int kBackgroundColor = 2; // white, which also hides the gridlines
inline constexpr int kTitleColor = 12;
inline constexpr int kGridColor = 16;
inline constexpr int kTotalFiguresColor = 39;
inline constexpr int kSectionHeadingColor = 43;
inline constexpr int kColumnHeadingColor = 55; // also the labels of total rows

// Headings, labels of totals and sections, and the title block are bold.
inline constexpr char kBold[] = "Bold";
inline constexpr double kHeadingFontSize = 9;

} // namespace penmoor
