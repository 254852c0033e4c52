#pragma once

#include "model/itemindex.h"

#include <string>
#include <string_view>

namespace penmoor {

// The linkage list of an item named name in the list that index describes: the positions of
// the items a total or balance combines, joined by ",". Empty for every name without a rule.
// A rule's item that is not in the list contributes nothing (and no stray separator).
std::string linkageFor(std::string_view name, const ItemIndex& index);

} // namespace penmoor
