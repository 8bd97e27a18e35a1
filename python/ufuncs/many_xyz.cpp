#include "many_xyz.h"

#include <algorithm>
#include <cstring>

namespace {

using OneByOne = Loop<ReflToXYZ, Returns::success>;

#ifdef __x86_64__

constexpr double kScale = 100000;

using Lanes = double __attribute__((vector_size(32))); // X, Y, Z and 0
struct Weights {
    Lanes bands[VANTREL_BANDS];
};

/// The weights of every combination, read back band by band: they are whole numbers, and a
/// reflectance of kScale in one band yields the weight itself.
std::array<Weights, NUM_ILLUM_OBS> read_weights()
{
    std::array<Weights, NUM_ILLUM_OBS> all{};
    for (int k = 0; k < NUM_ILLUM_OBS; ++k)
        for (int i = 0; i < VANTREL_BANDS; ++i) {
            double refl[VANTREL_BANDS] = {};
            refl[i] = kScale;
            ReflToXYZ(refl, ILLUM_OBS(k), reinterpret_cast<double *>(&all[k].bands[i]));
        }
    return all;
}

constexpr int kTogether = 8; // as many sums as hide each other's waiting
constexpr int kAhead = 32;   // spectra are fetched this far ahead of their use: some 8,000 bytes

/// The XYZ of kTogether spectra; those from `ahead` on are fetched from memory meanwhile.
[[gnu::target("avx2")]] void several_xyz(const char *refl, const char *ahead, npy_intp step,
                                         const Weights &weights, char *xyz, npy_intp xyz_step)
{
    for (int k = 0; k < kTogether; ++k)
        for (std::size_t line = 0; line < VANTREL_BANDS * sizeof(double); line += 64)
            __builtin_prefetch(ahead + k * step + line);
    Lanes sums[kTogether] = {};
    for (int i = 0; i < VANTREL_BANDS; ++i)
        for (int k = 0; k < kTogether; ++k)
            sums[k] += reinterpret_cast<const double *>(refl + k * step)[i] * weights.bands[i];
    for (const Lanes &sum : sums) {
        const Lanes result = sum / kScale;
        std::memcpy(xyz, &result, 3 * sizeof(double));
        xyz += xyz_step;
    }
}

bool side_by_side(const npy_intp *steps)
{
    return steps[1] == 0 && steps[3] == sizeof(double) && steps[4] == sizeof(double);
}

#endif

} // namespace

void many_xyz(char **rows, const npy_intp *dimensions, const npy_intp *steps, void *data)
{
#ifdef __x86_64__
    static const bool has_avx2 = __builtin_cpu_supports("avx2");
    const bool plain = !static_cast<const Layout *>(data)->flags && dimensions[0] >= kTogether;
    if (has_avx2 && plain && side_by_side(steps)) {
        static const auto weights = read_weights();
        const npy_int64 illum_obs = *reinterpret_cast<const npy_int64 *>(rows[1]);
        if (illum_obs >= 0 && illum_obs < NUM_ILLUM_OBS) {
            const npy_intp together = dimensions[0] / kTogether * kTogether;
            for (npy_intp n = 0; n < together; n += kTogether) {
                const npy_intp ahead = std::min(n + kAhead, together - kTogether);
                several_xyz(rows[0] + n * steps[0], rows[0] + ahead * steps[0], steps[0],
                            weights[illum_obs], rows[2] + n * steps[2], steps[2]);
            }
            char *rest[] = {rows[0] + together * steps[0], rows[1], rows[2] + together * steps[2]};
            const npy_intp remaining[] = {dimensions[0] - together, dimensions[1], dimensions[2]};
            OneByOne::run(rest, remaining, steps, data);
            return;
        }
    }
#endif
    OneByOne::run(rows, dimensions, steps, data);
}
