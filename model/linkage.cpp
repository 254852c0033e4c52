#include "model/linkage.h"

#include "model/itemrules.h"

#include <array>
#include <charconv>

namespace penmoor {

namespace {

class PositionList {
public:
    void append(int position)
    {
        if (!m_text.empty()) {
            m_text += ',';
        }
        std::array<char, 12> digits {};
        const auto result = std::to_chars(digits.data(), digits.data() + digits.size(), position);
        m_text.append(digits.data(), result.ptr);
    }

    // Every position of an item matching name.
    void appendPositionsOf(std::string_view name, const ItemIndex& index)
    {
        for (const int position : index.positions(name)) {
            append(position);
        }
    }

    // Every position from the item named first up to the one before the item named total,
    // each once. While names are unique, as the editor keeps them, this is the same as taking
    // the positions of each name in the range; repeated names, which only a list written from
    // outside can hold, would otherwise be counted more than once.
    void appendRange(std::string_view first, std::string_view total, const ItemIndex& index)
    {
        const int start = index.lastPosition(first);
        const int end = index.lastPosition(total) - 1;
        if (start == 0) {
            return;
        }
        for (int position = start; position <= end; ++position) {
            append(position);
        }
    }

    std::string take() { return std::move(m_text); }

private:
    std::string m_text;
};

} // namespace

std::string linkageFor(std::string_view name, const ItemIndex& index)
{
    PositionList links;
    if (name == kCashOnHand) {
        links.appendPositionsOf(kCashPosition, index);
    } else if (name == kTotalCashReceipts) {
        links.appendRange(kCashSales, name, index);
    } else if (name == kTotalCashAvailable) {
        // Opening cash plus the receipts total and any line placed between that total and this
        // one. The receipt lines themselves are inside the receipts total, so they are not
        // added a second time.
        links.appendPositionsOf(kCashOnHand, index);
        links.appendRange(kTotalCashReceipts, name, index);
    } else if (name == kSubtotal) {
        links.appendRange(kPurchasesMerchandise, name, index);
    } else if (name == kTotalCashPaidOut) {
        links.appendRange(kSubtotal, name, index);
    } else if (name == kCashPosition) {
        links.appendPositionsOf(kTotalCashAvailable, index);
        links.appendPositionsOf(kTotalCashPaidOut, index);
    }
    return links.take();
}

} // namespace penmoor
