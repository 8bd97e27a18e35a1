#include "many_xyz.h"

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

[[gnu::target("avx2")]] void four_xyz(const char *refl, npy_intp step, const Weights &weights,
                                      char *xyz, npy_intp xyz_step)
{
    const auto *a = reinterpret_cast<const double *>(refl);
    const auto *b = reinterpret_cast<const double *>(refl + step);
    const auto *c = reinterpret_cast<const double *>(refl + 2 * step);
    const auto *d = reinterpret_cast<const double *>(refl + 3 * step);
    Lanes sums[4] = {};
    for (int i = 0; i < VANTREL_BANDS; ++i) {
        sums[0] += a[i] * weights.bands[i];
        sums[1] += b[i] * weights.bands[i];
        sums[2] += c[i] * weights.bands[i];
        sums[3] += d[i] * weights.bands[i];
    }
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
    const bool plain = !static_cast<const Layout *>(data)->flags && dimensions[0] >= 4;
    if (has_avx2 && plain && side_by_side(steps)) {
        static const auto weights = read_weights();
        const npy_int64 illum_obs = *reinterpret_cast<const npy_int64 *>(rows[1]);
        if (illum_obs >= 0 && illum_obs < NUM_ILLUM_OBS) {
            const npy_intp fours = dimensions[0] / 4 * 4;
            for (npy_intp n = 0; n < fours; n += 4)
                four_xyz(rows[0] + n * steps[0], steps[0], weights[illum_obs],
                         rows[2] + n * steps[2], steps[2]);
            char *rest[] = {rows[0] + fours * steps[0], rows[1], rows[2] + fours * steps[2]};
            const npy_intp remaining[] = {dimensions[0] - fours, dimensions[1], dimensions[2]};
            OneByOne::run(rest, remaining, steps, data);
            return;
        }
    }
#endif
    OneByOne::run(rows, dimensions, steps, data);
}
