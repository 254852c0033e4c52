#pragma once

namespace penmoor::engine {

class Sheet;
class Workbook;

// Brings the result of every formula of the sheet up to date when its contents changed since
// the last recalculation. Each formula is evaluated once, after the formulas it refers to, in
// time linear in the number of formulas and the cells their references cover, and without
// recursion, so chains of any length are safe. A formula that reaches itself, directly or
// through others, gives #REF!, and so do the formulas on that circle.
void recalculate(Sheet& sheet);
void recalculate(Workbook& workbook);

} // namespace penmoor::engine
