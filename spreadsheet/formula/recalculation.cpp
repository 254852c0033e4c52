#include "spreadsheet/formula/recalculation.h"

#include "spreadsheet/formula/evaluator.h"
#include "spreadsheet/workbook/workbook.h"

#include <algorithm>
#include <unordered_map>
#include <vector>

namespace penmoor::engine {

namespace {

class Recalculation : public CellValueSource {
public:
    explicit Recalculation(Sheet& sheet)
        : m_sheet(sheet)
    {
    }

    void bringUpToDate(CellPosition position, Formula& formula)
    {
        if (state(formula) == State::Done)
            return;
        start(position, formula);
        while (!m_frames.empty()) {
            Frame& frame = m_frames.back();
            if (const std::optional<CellPosition> dependency = nextPendingDependency(frame)) {
                start(*dependency, *m_sheet.formula(*dependency));
                continue;
            }
            frame.formula->cachedValue = evaluateFormula(frame.formula->tokens, frame.position, *this);
            m_states[frame.formula] = State::Done;
            m_frames.pop_back();
        }
    }

    xl::Value value(CellPosition position) const override
    {
        const CellContent* content = m_sheet.content(position);
        return content ? valueOf(*content) : xl::Value();
    }

    void forEachValue(const Region& region, const std::function<bool(const xl::Value&)>& visit) const override
    {
        bool going = true;
        m_sheet.forEachContent(region, [&](CellPosition, const CellContent& content) {
            if (going)
                going = visit(valueOf(content));
        });
    }

private:
    enum class State { Pending, InProgress, Done };

    // A formula being brought up to date, with how far the search for formulas it reads has got.
    struct Frame {
        CellPosition position;
        Formula* formula = nullptr;
        std::size_t token = 0;
        CellPosition areaCursor { 0, 0 }; // inside the current block reference
    };

    State state(const Formula& formula) const
    {
        const auto it = m_states.find(&formula);
        return it == m_states.end() ? State::Pending : it->second;
    }

    void start(CellPosition position, Formula& formula)
    {
        m_states[&formula] = State::InProgress;
        m_frames.push_back({ position, &formula, 0, { 0, 0 } });
    }

    // A cell on the circle being worked through reads as #REF!.
    xl::Value valueOf(const CellContent& content) const
    {
        if (const Formula* formula = std::get_if<Formula>(&content))
            return state(*formula) == State::InProgress ? xl::Value(xl::ErrorValue::Ref) : formula->cachedValue;
        return cellValue(content);
    }

    bool isPendingFormula(CellPosition position) const
    {
        const CellContent* content = m_sheet.content(position);
        const Formula* formula = content ? std::get_if<Formula>(content) : nullptr;
        return formula && state(*formula) == State::Pending;
    }

    // The next formula this frame's formula reads that has not been brought up to date yet.
    std::optional<CellPosition> nextPendingDependency(Frame& frame) const
    {
        const TokenArray& tokens = frame.formula->tokens;
        for (; frame.token < tokens.size(); ++frame.token, frame.areaCursor = { 0, 0 }) {
            const Token& token = tokens[frame.token];
            std::optional<Region> area;
            if (const ReferenceToken* reference = std::get_if<ReferenceToken>(&token))
                area = resolveArea(reference->cell, reference->cell, frame.position);
            else if (const AreaToken* block = std::get_if<AreaToken>(&token))
                area = resolveArea(block->first, block->last, frame.position);
            if (!area)
                continue;
            if (area->isSingleCell()) {
                if (isPendingFormula(area->topLeft()))
                    return area->topLeft();
                continue;
            }
            if (const std::optional<CellPosition> found = nextPendingIn(*area, frame.areaCursor))
                return found;
        }
        return std::nullopt;
    }

    // The first pending formula in the block at or after the cursor, which moves there.
    std::optional<CellPosition> nextPendingIn(const Region& area, CellPosition& cursor) const
    {
        const int lastRow = std::min(area.lastRow, m_sheet.lastStoredRow());
        for (int row = std::max(area.firstRow, cursor.row); row <= lastRow; ++row) {
            const std::vector<CellEntry>& cells = m_sheet.rowData(row)->cells;
            const int fromColumn = row == cursor.row ? cursor.column : area.firstColumn;
            auto it = std::lower_bound(cells.begin(), cells.end(), fromColumn,
                [](const CellEntry& entry, int column) { return entry.column < column; });
            for (; it != cells.end() && it->column <= area.lastColumn; ++it) {
                const Formula* formula = std::get_if<Formula>(&it->content);
                if (formula && state(*formula) == State::Pending) {
                    cursor = { row, it->column };
                    return cursor;
                }
            }
        }
        cursor = { lastRow + 1, area.firstColumn };
        return std::nullopt;
    }

    Sheet& m_sheet;
    std::unordered_map<const Formula*, State> m_states;
    std::vector<Frame> m_frames;
};

} // namespace

void recalculate(Sheet& sheet)
{
    if (!sheet.needsRecalculation())
        return;
    Recalculation recalculation(sheet);
    sheet.forEachFormula(
        [&](CellPosition position, Formula& formula) { recalculation.bringUpToDate(position, formula); });
    sheet.markCalculated();
}

void recalculate(Workbook& workbook)
{
    for (int index = 0; index < workbook.sheetCount(); ++index)
        recalculate(workbook.sheet(index));
}

} // namespace penmoor::engine
