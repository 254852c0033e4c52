#include "shell/unitrandom.h"

#include <random>

namespace penmoor {

UnitRandom seededUnitRandom()
{
    std::random_device entropy;
    std::seed_seq seed { entropy(), entropy(), entropy(), entropy() };
    return
        [generator = std::mt19937_64(seed), distribution = std::uniform_real_distribution<double>(0.0, 1.0)]() mutable {
            return distribution(generator);
        };
}

} // namespace penmoor
