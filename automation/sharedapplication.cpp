#include "automation/sharedapplication.h"

#include "automation/existing.h"

namespace penmoor {

void SharedApplication::StartSpreadsheet(xl::ApplicationFactory& factory)
{
    m_application = factory.create();
}

void SharedApplication::ReleaseSpreadsheet()
{
    m_application.reset();
}

xl::Application& SharedApplication::application() const
{
    return existing(m_application, "spreadsheet application");
}

} // namespace penmoor
