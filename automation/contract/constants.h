#pragma once

// Values of the spreadsheet object model's enumerations, exactly as the program sends them.

namespace xl {

// HorizontalAlignment and VerticalAlignment
inline constexpr int kAlignGeneral = 1;
inline constexpr int kAlignLeft = -4131;
inline constexpr int kAlignCenter = -4108;
inline constexpr int kAlignRight = -4152;
inline constexpr int kAlignTop = -4160;
inline constexpr int kAlignBottom = -4107;

// Borders(edge): the index of an edge of a range
inline constexpr int kEdgeLeft = 7;
inline constexpr int kEdgeTop = 8;
inline constexpr int kEdgeBottom = 9;
inline constexpr int kEdgeRight = 10;
inline constexpr int kInsideVertical = 11;
inline constexpr int kInsideHorizontal = 12;

// Border Weight and LineStyle
inline constexpr int kWeightHairline = 1;
inline constexpr int kWeightThin = 2;
inline constexpr int kWeightMedium = -4138;
inline constexpr int kWeightThick = 4;
inline constexpr int kLineStyleContinuous = 1;
inline constexpr int kLineStyleNone = -4142;

// ColorIndex of fonts, borders and interiors
inline constexpr int kColorIndexAutomatic = -4105;
inline constexpr int kColorIndexNone = -4142;

// PageSetup
inline constexpr int kPrintNoComments = -4142;
inline constexpr int kPrintCommentsInPlace = 16;
inline constexpr int kPrintCommentsAtEnd = 1;
inline constexpr int kOrientationPortrait = 1;
inline constexpr int kOrientationLandscape = 2;
inline constexpr int kPaperLetter = 1;
inline constexpr int kPaperA4 = 9;

// Application.Cursor
inline constexpr int kCursorDefault = -4143;
inline constexpr int kCursorNorthwestArrow = 1;
inline constexpr int kCursorWait = 2;
inline constexpr int kCursorIBeam = 3;

// Application.EnableCancelKey
inline constexpr int kCancelKeyDisabled = 0;
inline constexpr int kCancelKeyInterrupt = 1;
inline constexpr int kCancelKeyErrorHandler = 2;

// Points per inch, for InchesToPoints
inline constexpr double kPointsPerInch = 72.0;

} // namespace xl
