// The variants of the tristimulus sum differ in speed alone.
#include "colorimetry/tristimulus.h"

#include <gtest/gtest.h>

#include <cstring>
#include <random>

#ifdef VANTREL_AVX2
TEST(Tristimulus, EveryVariantGivesTheSameBits)
{
    if (!__builtin_cpu_supports("avx2"))
        GTEST_SKIP() << "no AVX2 here";
    std::mt19937 generator(20);
    std::uniform_real_distribution<double> percent(-5, 120);
    for (int round = 0; round < 500; ++round) {
        vantrel::Bands refl;
        if (round < 2)
            refl.fill(round ? 1e300 : -1e-310);
        else
            std::ranges::generate(refl, [&] { return percent(generator); });
        for (int k = 0; k < NUM_ILLUM_OBS; ++k) {
            const auto &weights = vantrel::tristimulus_weights(static_cast<ILLUM_OBS>(k));
            const auto plain = vantrel::integrate(refl, weights);
            const auto avx2 = vantrel::integrate_avx2(refl, weights);
            ASSERT_EQ(std::memcmp(&plain, &avx2, sizeof plain), 0) << k;
        }
    }
}
#endif
