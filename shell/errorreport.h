#pragma once

#include "shell/dialogs.h"

#include <exception>
#include <functional>
#include <string>
#include <string_view>

namespace penmoor {

// Where a failure happened, one text per reporting procedure. The texts are fixed: users
// send screenshots of them, and support finds the procedure by them.
namespace errorlocation {
inline constexpr std::string_view GenerateReport0 = "in Quarrytab11/7/2013.TwelveMonthCashFlow.GenerateReport0 ";
inline constexpr std::string_view Form1PushButton2Click = "in Quarrytab11/7/2013.Form1.PushButton2_Click ";
inline constexpr std::string_view Form1PushButton22Click = "in Quarrytab11/7/2013.Form1.PushButton22_Click ";
inline constexpr std::string_view Form1PushButton3Click = "in Quarrytab11/7/2013.Form1.PushButton3_Click ";
inline constexpr std::string_view Form1PushButton5Click = "in Quarrytab11/7/2013.Form1.PushButton5_Click ";
inline constexpr std::string_view Form1PushButton6Click = "in Quarrytab11/7/2013.Form1.PushButton6_Click ";
inline constexpr std::string_view Form2PushButton1Click = "in Quarrytab11/7/2013.Form2.PushButton1_Click ";
inline constexpr std::string_view Form2PushButton2Click = "in Quarrytab11/7/2013.Form2.PushButton2_Click ";
inline constexpr std::string_view Form2PushButton6Click = "in Quarrytab11/7/2013.Form2.PushButton6_Click ";
inline constexpr std::string_view Form2PushButton8Click = "in Quarrytab11/7/2013.Form2.PushButton8_Click ";
} // namespace errorlocation

inline constexpr std::string_view kSupportAddress = "support@penmoor.example";

// The report's text: the description, then where and at which line, then the request for
// a screenshot. The two characters before the request are lone carriage returns.
std::string composeErrorReport(std::string_view description, std::string_view location, int line);

// The modal box that shows the report: "Application Error", exclamation icon, OK.
MessageRequest errorReportRequest(std::string_view description, std::string_view location, int line);

// One run of a reporting procedure. Each numbered statement runs through step(); when it
// fails, the failure is reported with the procedure's location and that line, and the
// procedure goes on with its next statement. A failure deep inside a called routine ends that
// routine and is reported here with the line of the call, because the routine has no report
// of its own and simply throws.
//
//     ReportingProcedure proc(dialogs, errorlocation::Form2PushButton6Click);
//     proc.step(100, [&] { path = dialogs.askSavePath(request); });
//     proc.step(102, [&] { copyWorkbook(path); });
class ReportingProcedure {
public:
    ReportingProcedure(Dialogs& dialogs, std::string_view location);

    // Runs one statement numbered line; true when it completed, false when it failed and
    // was reported.
    template <typename Statement> bool step(int line, Statement&& statement)
    {
        try {
            std::invoke(std::forward<Statement>(statement));
            return true;
        } catch (...) {
            report(std::current_exception(), line);
            return false;
        }
    }

private:
    void report(const std::exception_ptr& failure, int line);

    Dialogs& m_dialogs;
    std::string m_location;
};

} // namespace penmoor
