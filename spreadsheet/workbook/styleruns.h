#pragma once

#include "spreadsheet/workbook/style.h"

#include <algorithm>
#include <cstdint>
#include <optional>
#include <vector>

namespace penmoor::engine {

// Consecutive cells of one row that carry the same format of their own.
struct StyleRun {
    std::uint16_t firstColumn = 1;
    std::uint16_t lastColumn = 1;
    StyleId style = kDefaultStyleId;

    bool operator==(const StyleRun&) const = default;
};

// A row's own cell formats: runs sorted by column, never overlapping, and never two touching
// runs of the same style (they are joined), so a uniformly formatted row is one run.
using StyleRuns = std::vector<StyleRun>;

std::optional<StyleId> findRunStyle(const StyleRuns& runs, int column);

// Appends a run, joining it to the last one when they touch and share the style.
void appendRun(StyleRuns& runs, int firstColumn, int lastColumn, StyleId style);

// Gives columns first..last their own format `style`.
void assignRuns(StyleRuns& runs, int firstColumn, int lastColumn, StyleId style);

// Removes the own formats of columns first..last.
void eraseRuns(StyleRuns& runs, int firstColumn, int lastColumn);

// Rebuilds columns first..last of a row: each part of a run there gets mapRun(style); each
// stretch without runs is handed to fillGap(gapFirst, gapLast, out), which appends the runs
// (if any) that the stretch needs to `out` in column order. `scratch` is reused storage.
template <class MapRun, class FillGap>
void rewriteRuns(StyleRuns& runs, int first, int last, MapRun&& mapRun, FillGap&& fillGap, StyleRuns& scratch)
{
    scratch.clear();
    auto it = std::lower_bound(
        runs.begin(), runs.end(), first, [](const StyleRun& run, int column) { return run.lastColumn < column; });
    // Runs entirely before the block stay as they are.
    for (auto before = runs.begin(); before != it; ++before)
        appendRun(scratch, before->firstColumn, before->lastColumn, before->style);
    // A run that starts before the block keeps its part outside it.
    if (it != runs.end() && it->firstColumn < first)
        appendRun(scratch, it->firstColumn, first - 1, it->style);

    int column = first;
    for (; it != runs.end() && it->firstColumn <= last; ++it) {
        const int runFirst = std::max<int>(it->firstColumn, first);
        if (runFirst > column)
            fillGap(column, runFirst - 1, scratch);
        const int runLast = std::min<int>(it->lastColumn, last);
        appendRun(scratch, runFirst, runLast, mapRun(it->style));
        column = runLast + 1;
        if (it->lastColumn > last) {
            // The rest of this run lies after the block.
            appendRun(scratch, last + 1, it->lastColumn, it->style);
            ++it;
            break;
        }
    }
    if (column <= last)
        fillGap(column, last, scratch);
    for (; it != runs.end(); ++it)
        appendRun(scratch, it->firstColumn, it->lastColumn, it->style);
    runs.assign(scratch.begin(), scratch.end());
}

} // namespace penmoor::engine
