#include "tests/support/temporaryfolder.h"

#include <random>
#include <stdexcept>
#include <string>
#include <system_error>

namespace penmoor::testing {

TemporaryFolder::TemporaryFolder()
{
    std::random_device entropy;
    const std::filesystem::path base = std::filesystem::temp_directory_path();
    for (int attempt = 0; attempt < 100; ++attempt) {
        const std::filesystem::path candidate = base / ("penmoor-test-" + std::to_string(entropy()));
        // create_directory reports false for an existing folder, so two tests never share one.
        if (std::filesystem::create_directory(candidate)) {
            m_path = candidate;
            return;
        }
    }
    throw std::runtime_error("cannot create a temporary test folder in " + base.string());
}

TemporaryFolder::~TemporaryFolder()
{
    std::error_code ignored; // a folder left behind must not fail the test that used it
    std::filesystem::remove_all(m_path, ignored);
}

} // namespace penmoor::testing
