// The formulas of the library over batches of rows; compiled once for each width.
#include "batch.h"

#include "colorimetry/illuminants.h"
#include "colorimetry/lab.h"
#include "colorimetry/tristimulus.h"
#include "colorimetry/verbal.h"
#include "density/automatic_response.h"
#include "density/density.h"
#include "density/weighted.h"
#include "difference/cie76.h"
#include "difference/cmc.h"
#include "difference/de2000.h"
#include "difference/de94.h"
#include "inks/film.h"
#include "inks/overprint.h"
#include "inks/tint.h"
#include "print/dot_area.h"

#include <optional>

namespace {

// Each loop is one function with all that it calls: what goes on in registers stays there.

bool is_same_illum_obs(const Operand &o)
{
    return is_same(o) && integer(o) >= 0 && integer(o) < NUM_ILLUM_OBS;
}
ILLUM_OBS illum_obs(const Operand &o) { return static_cast<ILLUM_OBS>(integer(o)); }

// Colours.

Xyz xyzs(const Operand &refl, const Batch &batch, ILLUM_OBS illum_obs)
{
    return vantrel::xyz_from_bands(spectra(refl, batch), vantrel::tristimulus_weights(illum_obs));
}

/// L*a*b* of spectra; of one that is the same in all rows, once.
class Labs {
public:
    Labs(const Operand &spectra_of, ILLUM_OBS combination)
        : refl(spectra_of), illum_obs(combination)
    {
        if (is_same(refl))
            same = of({0, 0});
    }
    Lab operator()(const Batch &batch) { return is_same(refl) ? same : of(batch); }

    Finite finite;

private:
    Lab of(const Batch &batch)
    {
        const Xyz xyz = xyzs(refl, batch, illum_obs);
        finite(xyz.x);
        return vantrel::lab_from_xyz(xyz, vantrel::white_point(illum_obs));
    }

    const Operand &refl;
    ILLUM_OBS illum_obs;
    Lab same = {0, 0, 0};
};

[[gnu::flatten]] Done refl_to_xyz(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_same_illum_obs(o[1]))
        return Done::nothing;
    Finite finite;
    each_batch(rows, [&](const Batch &batch) {
        const Xyz xyz = xyzs(o[0], batch, illum_obs(o[1]));
        finite(xyz.x);
        store(o[2], batch, xyz.x, xyz.y, xyz.z);
    });
    return finite.done();
}

[[gnu::flatten]] Done refl_to_cielab(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_same_illum_obs(o[1]))
        return Done::nothing;
    Labs labs(o[0], illum_obs(o[1]));
    each_batch(rows, [&](const Batch &batch) {
        const Lab lab = labs(batch);
        store(o[2], batch, lab.L, lab.a, lab.b);
    });
    return labs.finite.done();
}

[[gnu::flatten]] Done xyz_to_cielab(const Operand *o, npy_intp rows)
{
    if (!is_same_illum_obs(o[1]))
        return Done::nothing;
    const vantrel::Xyz &white = vantrel::white_point(illum_obs(o[1]));
    each_batch(rows, [&](const Batch &batch) {
        const Xyz xyz = {values(o[0], batch, 0), values(o[0], batch, 1), values(o[0], batch, 2)};
        const Lab lab = vantrel::lab_from_xyz(xyz, white);
        store(o[2], batch, lab.L, lab.a, lab.b);
    });
    return Done::rows;
}

[[gnu::flatten]] Done metamerism(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_spectrum(o[1]) || !is_same_illum_obs(o[2]) ||
        !is_same_illum_obs(o[3]))
        return Done::nothing;
    const ILLUM_OBS first = illum_obs(o[2]), second = illum_obs(o[3]);
    Labs standards1(o[0], first), standards2(o[0], second);
    each_batch(rows, [&](const Batch &batch) {
        const Bands refl = spectra(o[1], batch);
        const auto lab = [&](ILLUM_OBS k) {
            return vantrel::lab_from_xyz(
                vantrel::xyz_from_bands(refl, vantrel::tristimulus_weights(k)),
                vantrel::white_point(k));
        };
        store(o[4], batch,
              vantrel::delta_e76(lab(first), standards1(batch)) +
                  vantrel::delta_e76(lab(second), standards2(batch)));
    });
    return Done::rows;
}

/// L*, a*, b*, C*, h of each lane.
struct Labchs {
    explicit Labchs(const Lab &lab) : L(lab.L), a(lab.a), b(lab.b)
    {
        const auto lch = vantrel::lch_from_lab(vantrel::rounded(lab));
        C = lch.C;
        h = lch.h;
    }
    vantrel::Labch operator[](int lane) const
    {
        return {static_cast<float>(L[lane]), static_cast<float>(a[lane]),
                static_cast<float>(b[lane]), static_cast<float>(C[lane]),
                static_cast<float>(h[lane])};
    }
    V L, a, b, C, h;
};

[[gnu::flatten]] Done verbal_color_difference(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_spectrum(o[1]) || !is_same_illum_obs(o[2]) || !is_same(o[3]))
        return Done::nothing;
    Labs standards(o[0], illum_obs(o[2])), samples(o[1], illum_obs(o[2]));
    const npy_int64 selector = integer(o[3]);
    each_batch(rows, [&](const Batch &batch) {
        const Labchs standard(standards(batch)), sample(samples(batch));
        for (int lane = 0; lane < batch.rows(); ++lane) {
            const vantrel::Labch s1 = standard[lane], s2 = sample[lane];
            const auto put = [&](const Operand &out, vantrel::Word word) {
                *reinterpret_cast<int *>(out.row + batch.row(lane) * out.step) =
                    static_cast<int>(word);
            };
            using vantrel::Word;
            put(o[4], vantrel::lightness_word(s1, s2));
            put(o[5], selector == 0   ? vantrel::red_green_word(s1, s2)
                      : selector == 1 ? vantrel::chroma_word(s1, s2)
                                      : Word::none);
            put(o[6], selector == 0   ? vantrel::yellow_blue_word(s1, s2)
                      : selector == 1 ? vantrel::hue_word(s1, s2)
                                      : Word::none);
        }
    });
    return Done::rows;
}

// Colour differences.

[[gnu::flatten]] Done lab_to_de94(const Operand *o, npy_intp rows)
{
    if (!is_same(o[2]) || !is_same(o[3]))
        return Done::nothing;
    each_batch(rows, [&](const Batch &batch) {
        store(o[4], batch,
              vantrel::delta_e94(labs(o[0], batch), labs(o[1], batch), number(o[2]), number(o[3])));
    });
    return Done::rows;
}

[[gnu::flatten]] Done lab_to_de2000(const Operand *o, npy_intp rows)
{
    if (!is_same(o[2]) || !is_same(o[3]))
        return Done::nothing;
    each_batch(rows, [&](const Batch &batch) {
        store(o[4], batch,
              vantrel::delta_e2000(labs(o[0], batch), labs(o[1], batch),
                                   {number(o[2]), number(o[3]), 1}, vantrel::kPow25To7));
    });
    return Done::rows;
}

[[gnu::flatten]] Done lab_to_de_cmc(const Operand *o, npy_intp rows)
{
    if (!is_same(o[2]) || !is_same(o[3]) || !is_same(o[4]) || number(o[2]) == 0 ||
        number(o[3]) == 0)
        return Done::nothing;
    each_batch(rows, [&](const Batch &batch) {
        store(o[5], batch,
              vantrel::delta_e_cmc(labs(o[0], batch), labs(o[1], batch), number(o[2]), number(o[3]),
                                   integer(o[4]) != 0));
    });
    return Done::rows;
}

// Densities.

bool is_paper(const Operand &o) { return o.size() == 0 || is_spectrum(o); }

/// A status whose densities are weighted sums, one by one.
bool is_same_filter(const Operand &status, const Operand &response)
{
    if (!is_same(status) || !is_same(response))
        return false;
    const npy_int64 s = integer(status), r = integer(response);
    return s >= 0 && s < NUM_STATUSES && s != SPECTRAL_STATUS && s != SPECTRALX_STATUS &&
           s != CCR2_STATUS && r >= 0 && r < NUM_RESPONSES;
}

/// The densities of spectra in one filter over a paper; that of a paper of all rows is taken once.
class Densities {
public:
    Densities(const Operand &below, int status, int response) : paper(below)
    {
        for (int i = 0; i < kBands; ++i)
            weights[i] = static_cast<double>(vantrel::weights_of(status, response)[i]);
        if (paper.size() && is_same(paper))
            same = vantrel::density_of_sum(sum(spectra(paper, {0, 0})));
    }
    /// Σ R w of a patch and of its paper.
    struct Sums {
        V patch, paper;
    };
    Sums sums(const Bands &refl, const Batch &batch)
    {
        const bool each = paper.size() && !is_same(paper);
        return {sum(refl), each ? sum(spectra(paper, batch)) : V(0)};
    }
    V operator()(const Sums &sums) const
    {
        const V density = vantrel::density_of_sum(sums.patch);
        if (!paper.size())
            return density;
        return density - (is_same(paper) ? same : vantrel::density_of_sum(sums.paper));
    }

    Finite finite;

private:
    V sum(const Bands &refl)
    {
        const V sum = vantrel::weighted_sum(refl, weights);
        finite(sum);
        return sum;
    }

    const Operand &paper;
    vantrel::Bands weights;
    V same = 0;
};

[[gnu::flatten]] Done refl_to_density(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_paper(o[1]) || !is_same_filter(o[2], o[3]))
        return Done::nothing;
    Densities density(o[1], static_cast<int>(integer(o[2])), static_cast<int>(integer(o[3])));
    each_batch(
        rows, [&](const Batch &batch) { return density.sums(spectra(o[0], batch), batch); },
        [&](const Batch &batch, const auto &sums) { store(o[4], batch, density(sums)); });
    return density.finite.done();
}

[[gnu::flatten]] Done refl_to_densities(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_paper(o[1]) || !is_same_filter(o[2], o[2]) ||
        integer(o[2]) == CCR1_STATUS)
        return Done::nothing;
    const int status = static_cast<int>(integer(o[2]));
    std::optional<Densities> densities[NUM_RESPONSES];
    for (const int response : vantrel::responses_of(status))
        densities[response].emplace(o[1], status, response);
    each_batch(rows, [&](const Batch &batch) {
        const Bands refl = spectra(o[0], batch);
        for (int response = VISUAL_RESPONSE; response < NUM_RESPONSES; ++response) {
            auto &density = densities[response];
            store(o[3], batch, density ? (*density)(density->sums(refl, batch)) : V(0), response);
        }
    });
    return densities[*vantrel::responses_of(status).begin()]->finite.done();
}

[[gnu::flatten]] Done determine_density_response(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_same(o[1]) || !is_spectrum(o[2]) || integer(o[1]) < 0 ||
        integer(o[1]) > T_STATUS)
        return Done::nothing;
    const int status = static_cast<int>(integer(o[1]));
    each_batch(rows, [&](const Batch &batch) {
        Bands refl = spectra(o[0], batch);
        const Bands paper = spectra(o[2], batch);
        auto rough = refl[0] == refl[0];
        for (int i = 0; i < kBands; ++i) {
            const V ratio = refl[i] / paper[i];
            rough = rough & vantrel::is_roughly_adjusted(refl[i], paper[i], ratio);
            refl[i] = vantrel::roughly_adjusted(refl[i], ratio);
        }
        const Xyz xyz = vantrel::xyz_from_bands(refl, vantrel::tristimulus_weights(D65_10DEG));
        const Lab lab = vantrel::lab_from_xyz(xyz, vantrel::white_point(D65_10DEG));
        const auto [response, firm] = vantrel::firm_response(refl, lab, status);
        const auto sure = rough & firm;
        store<int>(o[3], batch, response);
        for (int lane = 0; any(!sure) && lane < batch.rows(); ++lane) {
            if (sure.m[lane])
                continue;
            const auto row = [&](const Operand &operand) {
                return vantrel::spectrum(
                    reinterpret_cast<const double *>(operand.row + batch.row(lane) * operand.step));
            };
            *reinterpret_cast<int *>(o[3].row + batch.row(lane) * o[3].step) =
                vantrel::automatic_response(row(o[0]), status, row(o[2]));
        }
    });
    return Done::rows;
}

// Dot area and gain: solid, tint, paper, status, response, n.

template <class F> Done dot_areas(const Operand *o, npy_intp rows, F store_area)
{
    if (!is_spectrum(o[0]) || !is_spectrum(o[1]) || !is_paper(o[2]) ||
        !is_same_filter(o[3], o[4]) || !is_same(o[5]) || number(o[5]) == 0)
        return Done::nothing;
    Densities density(o[2], static_cast<int>(integer(o[3])), static_cast<int>(integer(o[4])));
    const auto absorbed = [&](const Densities::Sums &of) {
        return vantrel::absorptance(density(of), number(o[5]));
    };
    const bool same = is_same(o[0]) && (!o[2].size() || is_same(o[2]));
    const V solid = absorbed(density.sums(spectra(o[0], {0, 0}), {0, 0}));
    each_batch(
        rows, [&](const Batch &batch) { return density.sums(spectra(o[1], batch), batch); },
        [&](const Batch &batch, const Densities::Sums &tint) {
            store_area(batch,
                       vantrel::absorbed_area(
                           same ? solid : absorbed(density.sums(spectra(o[0], batch), batch)),
                           absorbed(tint)));
        });
    return std::isfinite(number(o[5])) ? density.finite.done() : Done::rows;
}

[[gnu::flatten]] Done refl_to_dot_area(const Operand *o, npy_intp rows)
{
    return dot_areas(o, rows, [&](const Batch &batch, V area) { store(o[6], batch, area); });
}

[[gnu::flatten]] Done refl_to_dot_gain(const Operand *o, npy_intp rows)
{
    if (!is_same(o[6]) || integer(o[6]) != static_cast<int>(integer(o[6])))
        return Done::nothing;
    const int nominal = static_cast<int>(integer(o[6]));
    return dot_areas(o, rows, [&](const Batch &batch, V area) {
        store(o[7], batch, vantrel::dot_gain(area, nominal));
    });
}

// Inks.

[[gnu::flatten]] Done estimate_refls_for_thickness(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_same(o[1]) || !is_spectrum(o[2]) || !is_spectrum(o[3]))
        return Done::nothing;
    const auto absorbances = [&](const Batch &batch) {
        Bands paper = spectra(o[2], batch);
        for (V &band : paper)
            band = vantrel::absorbance(band);
        return paper;
    };
    const Bands first = absorbances({0, 0});
    each_batch(rows, [&](const Batch &batch) {
        Bands refl = spectra(o[0], batch);
        const Bands paper = is_same(o[2]) ? first : absorbances(batch);
        for (int i = 0; i < kBands; ++i)
            refl[i] = vantrel::film_band(refl[i], number(o[1]), paper[i]);
        store(o[3], batch, refl);
    });
    return Done::rows;
}

[[gnu::flatten]] Done combine_ink_colors(const Operand *o, npy_intp rows)
{
    if (!is_spectrum(o[0]) || !is_spectrum(o[1]) || !is_spectrum(o[2]))
        return Done::nothing;
    each_batch(rows, [&](const Batch &batch) {
        store(o[2], batch, vantrel::overprint(spectra(o[0], batch), spectra(o[1], batch)));
    });
    return Done::rows;
}

[[gnu::flatten]] Done estimate_refls(const Operand *o, npy_intp rows)
{
    constexpr int kMostInks = 3;
    const npy_intp inks = o[0].counts[0];
    if (inks < 1 || inks > kMostInks || o[0].counts[1] != kBands || o[1].counts[0] != inks ||
        o[0].strides[1] != sizeof(double) || !is_same(o[1]) || !is_spectrum(o[2]) ||
        !is_spectrum(o[3]))
        return Done::nothing;
    Operand ink[kMostInks];
    int percent[kMostInks];
    for (int k = 0; k < inks; ++k) {
        ink[k] = o[0];
        ink[k].row += k * o[0].strides[0];
        const npy_int64 p = *reinterpret_cast<const npy_int64 *>(o[1].row + k * o[1].strides[0]);
        if (p < 0 || p > 100)
            return Done::nothing;
        percent[k] = static_cast<int>(p);
    }
    each_batch(rows, [&](const Batch &batch) {
        const Bands paper = spectra(o[2], batch);
        const auto layer = [&](int k) {
            Bands refl = spectra(ink[k], batch);
            for (int i = 0; percent[k] < 100 && i < kBands; ++i)
                refl[i] = vantrel::halftone_band(refl[i], percent[k], paper[i]);
            return refl;
        };
        Bands printed = layer(0);
        for (int k = 1; k < inks; ++k)
            printed = vantrel::overprint(printed, layer(k));
        store(o[3], batch, printed);
    });
    return Done::rows;
}

constexpr LaneLoop kLoops[] = {
    {"refl_to_xyz", refl_to_xyz, true},
    {"refl_to_cielab", refl_to_cielab, true},
    {"xyz_to_cielab", xyz_to_cielab},
    {"metamerism", metamerism},
    {"verbal_color_difference", verbal_color_difference},
    {"lab_to_de94", lab_to_de94},
    {"lab_to_de2000", lab_to_de2000},
    {"lab_to_de_cmc", lab_to_de_cmc},
    {"refl_to_density", refl_to_density, true},
    {"refl_to_densities", refl_to_densities, true},
    {"determine_density_response", determine_density_response},
    {"refl_to_dot_area", refl_to_dot_area, true},
    {"refl_to_dot_gain", refl_to_dot_gain, true},
    {"estimate_refls_for_thickness", estimate_refls_for_thickness},
    {"combine_ink_colors", combine_ink_colors},
    {"estimate_refls", estimate_refls},
};

/// x - x is 0, or not a number where x is not finite.
bool all_finite(const double *values, npy_intp count)
{
    constexpr int kSums = 4;
    V sums[kSums] = {0, 0, 0, 0};
    npy_intp i = 0;
    for (; i + kSums * N <= count; i += kSums * N)
        unrolled<kSums>([&](auto k) {
            const V x = loaded(reinterpret_cast<const char *>(values + i + k * N));
            sums[k] += x - x;
        });
    for (; i < count; ++i)
        sums[0] += V(values[i] - values[i]);
    return !any((sums[0] + sums[1]) + (sums[2] + sums[3]) != 0);
}

} // namespace

#if VANTREL_ROWS == 2
LaneLoops lane_loops_2() { return {kLoops, all_finite}; }
#elif VANTREL_ROWS == 4
LaneLoops lane_loops_4() { return {kLoops, all_finite}; }
#else
LaneLoops lane_loops_8() { return {kLoops, all_finite}; }
#endif
