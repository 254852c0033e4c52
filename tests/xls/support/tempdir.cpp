#include "tests/xls/support/tempdir.h"

#include <random>
#include <stdexcept>

namespace penmoor::xls::test {

TempDir::TempDir()
{
    std::random_device seed;
    std::mt19937_64 random(seed());
    for (int attempt = 0; attempt < 100; ++attempt) {
        auto candidate = std::filesystem::temp_directory_path() / ("penmoor-xls-" + std::to_string(random()));
        if (std::filesystem::create_directory(candidate)) {
            m_path = candidate;
            return;
        }
    }
    throw std::runtime_error("cannot create a temporary folder");
}

TempDir::~TempDir()
{
    std::error_code ignored; // a leftover temporary folder must not fail the test
    std::filesystem::remove_all(m_path, ignored);
}

} // namespace penmoor::xls::test
