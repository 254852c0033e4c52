#pragma once

#include <string>

namespace penmoor {

// How the sheet builder combines the items of a total's linkage list.
enum class TotalKind {
    None,
    Sum, // adds the listed items
    Dif, // the first listed item minus each of the others
    Other, // the opening balance, carried over from the previous period's cash position
};

// One line of the cash-flow plan. The record has seven fields in this order; the settings
// store counts them (its "System Value - Columns" is 7) but holds only name and included flag.
struct TemplateItem {
    // The text shown in List1. A leading "_" is dropped on the sheet, so two items can print
    // the same label while their names stay distinct.
    std::string name;
    // Whether the item's List1 entry was selected; the builder sets it for every item.
    bool included = true;
    // For a total: the 1-based positions of the items it combines, in decimal, joined by ","
    // without blanks. Empty for every other item.
    std::string linkage;
    TotalKind totalKind = TotalKind::None;
    // True for a section heading.
    bool section = false;
    // The item's worksheet row, written by the builder; 0 until the first build.
    int sheetRow = 0;
    // Carried with the item to make up the stored field count; nothing sets or reads it.
    std::string spare;
};

// The stored field count of a template item.
inline constexpr int kTemplateItemFieldCount = 7;

// List1 shows at most this many entries (its indexes are 16-bit), so the list holds no more.
inline constexpr int kMaximumItemCount = 32768;

} // namespace penmoor
