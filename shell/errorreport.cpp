#include "shell/errorreport.h"

namespace penmoor {

namespace {

std::string describeFailure(const std::exception_ptr& failure)
{
    try {
        std::rethrow_exception(failure);
    } catch (const std::exception& e) {
        return e.what();
    } catch (...) {
        return "Unknown failure";
    }
}

} // namespace

std::string composeErrorReport(std::string_view description, std::string_view location, int line)
{
    std::string text;
    text.append(description).append("\r\n");
    text.append(location).append("at line ").append(std::to_string(line));
    text.append("\r\r");
    text.append("Please email screenshot of this message to ").append(kSupportAddress);
    return text;
}

MessageRequest errorReportRequest(std::string_view description, std::string_view location, int line)
{
    return { composeErrorReport(description, location, line), MessageButtons::Ok, MessageIcon::Exclamation,
        "Application Error", DialogAnswer::Ok };
}

ReportingProcedure::ReportingProcedure(Dialogs& dialogs, std::string_view location)
    : m_dialogs(dialogs)
    , m_location(location)
{
}

void ReportingProcedure::report(const std::exception_ptr& failure, int line)
{
    m_dialogs.showMessage(errorReportRequest(describeFailure(failure), m_location, line));
}

} // namespace penmoor
