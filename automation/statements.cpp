#include "automation/statements.h"

namespace penmoor {

ReportingStatements::ReportingStatements(Dialogs& dialogs, std::string_view location)
    : m_procedure(dialogs, location)
{
}

bool ReportingStatements::run(int line, const std::function<void()>& statement)
{
    return m_procedure.step(line, statement);
}

bool FirstFailureStops::run(int, const std::function<void()>& statement)
{
    statement();
    return true;
}

} // namespace penmoor
