#pragma once

#include "automation/contract/application.h"

#include <memory>

namespace penmoor {

// The shared application reference: the spreadsheet application of the running build, which
// the build and the sheet builder reach through it. Empty outside a build.
class SharedApplication {
public:
    // The reference now holds a new instance. When none can be created the failure goes on to
    // the caller and the reference stays empty.
    void StartSpreadsheet(xl::ApplicationFactory& factory);
    // Empties the reference; the instance is not quit here.
    void ReleaseSpreadsheet();

    bool isEmpty() const { return !m_application; }
    // The instance; raises xl::Error when the reference is empty, as every use of a missing
    // application fails.
    xl::Application& application() const;

private:
    std::unique_ptr<xl::Application> m_application;
};

} // namespace penmoor
