#include "spreadsheet/workbook/styleruns.h"

namespace penmoor::engine {

std::optional<StyleId> findRunStyle(const StyleRuns& runs, int column)
{
    const auto it = std::lower_bound(
        runs.begin(), runs.end(), column, [](const StyleRun& run, int c) { return run.lastColumn < c; });
    if (it == runs.end() || it->firstColumn > column)
        return std::nullopt;
    return it->style;
}

void appendRun(StyleRuns& runs, int firstColumn, int lastColumn, StyleId style)
{
    if (!runs.empty() && runs.back().style == style && runs.back().lastColumn + 1 == firstColumn) {
        runs.back().lastColumn = static_cast<std::uint16_t>(lastColumn);
        return;
    }
    runs.push_back({ static_cast<std::uint16_t>(firstColumn), static_cast<std::uint16_t>(lastColumn), style });
}

void assignRuns(StyleRuns& runs, int firstColumn, int lastColumn, StyleId style)
{
    StyleRuns scratch;
    rewriteRuns(
        runs, firstColumn, lastColumn, [style](StyleId) { return style; },
        [style](int gapFirst, int gapLast, StyleRuns& out) { appendRun(out, gapFirst, gapLast, style); }, scratch);
}

void eraseRuns(StyleRuns& runs, int firstColumn, int lastColumn)
{
    StyleRuns kept;
    kept.reserve(runs.size() + 1);
    for (const StyleRun& run : runs) {
        if (run.lastColumn < firstColumn || run.firstColumn > lastColumn) {
            kept.push_back(run);
            continue;
        }
        if (run.firstColumn < firstColumn)
            kept.push_back({ run.firstColumn, static_cast<std::uint16_t>(firstColumn - 1), run.style });
        if (run.lastColumn > lastColumn)
            kept.push_back({ static_cast<std::uint16_t>(lastColumn + 1), run.lastColumn, run.style });
    }
    runs = std::move(kept);
}

} // namespace penmoor::engine
