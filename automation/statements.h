#pragma once

#include "shell/errorreport.h"

#include <functional>
#include <string_view>

namespace penmoor {

// How a procedure runs its numbered statements. The build of the window reports each failure
// and goes on with the next statement; the headless builder stops at the first failure.
class StatementRunner {
public:
    virtual ~StatementRunner() = default;

    // Runs the statement numbered line; false when it failed and the failure was dealt with.
    virtual bool run(int line, const std::function<void()>& statement) = 0;
};

// Shows the error report of the procedure at location for each failure, then goes on.
class ReportingStatements final : public StatementRunner {
public:
    ReportingStatements(Dialogs& dialogs, std::string_view location);

    bool run(int line, const std::function<void()>& statement) override;

private:
    ReportingProcedure m_procedure;
};

// Lets the first failure end the procedure: it goes on to the caller as it was raised.
class FirstFailureStops final : public StatementRunner {
public:
    bool run(int line, const std::function<void()>& statement) override;
};

} // namespace penmoor
