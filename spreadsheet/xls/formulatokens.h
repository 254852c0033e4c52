#pragma once

#include "spreadsheet/formula/token.h"
#include "spreadsheet/workbook/address.h"
#include "spreadsheet/xls/bytebuffer.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace penmoor::xls {

// Formulas as BIFF8 token arrays (postfix, as the model keeps them), for the formula of the cell
// at `cell` (1-based). A relative reference is stored as its absolute target with the relative
// bits set; a target off the sheet becomes a reference error. Operands of functions that take
// references get the reference class, every other operand the value class.

// Encodes formula after formula, keeping its working storage, so that a sheet of formulas is
// written without an allocation per cell.
class FormulaEncoder {
public:
    // Appends the token bytes to `out`. Returns false, with `out` as it was, when the formula
    // calls a function or names something the file cannot express without an external name
    // table (it then evaluates to #NAME? anyway). Raises WriteError for a text constant over
    // 255 characters or a malformed token array.
    bool encode(const engine::TokenArray& tokens, engine::CellPosition cell, ByteBuffer& out);

private:
    void markReferenceOperands(const engine::TokenArray& tokens, engine::CellPosition cell);

    std::vector<std::size_t> m_roots;
    std::vector<bool> m_byReference;
};

// The token bytes of one formula, as FormulaEncoder gives them.
std::optional<std::vector<std::uint8_t>> encodeFormula(const engine::TokenArray& tokens, engine::CellPosition cell);

// The model's tokens for these bytes, or nothing when they use something the model does not
// have (another sheet, a defined name, an unknown function); the cell then keeps its cached
// value. References of the offset kind (in shared formulas) hold signed offsets in their
// relative parts. Raises FormatError when a token runs past the end.
std::optional<engine::TokenArray> decodeFormula(std::span<const std::uint8_t> bytes, engine::CellPosition cell);

} // namespace penmoor::xls
