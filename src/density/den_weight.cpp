#include "density/den_weight.h"

#include <algorithm>
#include <array>
#include <numeric>

namespace vantrel {
namespace {

using Row = std::array<std::int64_t, kBands>;

/// Weights from a wavelength upward.
template <std::size_t Count> constexpr Row row(int first, const int (&weights)[Count])
{
    Row result{};
    for (std::size_t i = 0; i < Count; ++i)
        result[(first - 400) / 10 + i] = weights[i];
    return result;
}

constexpr std::int64_t sum(const Row &row)
{
    return std::accumulate(row.begin(), row.end(), std::int64_t{0});
}

// ISO 5-3 Statuses A, E, I and T as weights for 10 nm steps, the visual filter, the seven-band
// filters of the HiFi and Hexachrome statuses by their default centre, and the filters that the
// corrected densities start from.
// clang-format off
constexpr Row kVisual = row(400, {1, 2, 8, 27, 62, 118, 212, 366, 627, 1053, 1814, 3102, 4752, 6307, 7586, 8554, 9203, 9436, 9201, 8532, 7539, 6350, 5080, 3721, 2571, 1649, 983, 541, 295, 149, 158});
constexpr Row kARed = row(600, {1436, 15312, 32156, 25453, 14010, 6721, 2820, 1230, 515, 209, 137});
constexpr Row kAGreen = row(500, {14, 3189, 19048, 30748, 25534, 14266, 5558, 1422, 210, 12});
constexpr Row kABlue = row(420, {2834, 20882, 31698, 26371, 13828, 3968, 429, -7, -2});
constexpr Row kERed = row(560, {2, -96, 613, 10708, 29979, 27166, 17561, 8276, 3346, 1578, 525, 167, 93, 49, 33});
constexpr Row kEGreen = row(470, {8, 151, 943, 5226, 12116, 17037, 18826, 16962, 12986, 8450, 4564, 1953, 594, 154, 27, 2, 2});
constexpr Row kEBlue = row(400, {3155, 5865, 11259, 15604, 18654, 17295, 14262, 8912, 3619, 1174, 191, 8, 1, 2});
constexpr Row kIRed = row(610, {7800, 42200, 42200, 7800});
constexpr Row kIGreen = row(520, {7800, 42200, 42200, 7800});
constexpr Row kIBlue = row(410, {529, 25224, 48494, 25224, 529});
constexpr Row kTBlue = row(400, {1166, 2498, 5569, 8479, 11446, 13194, 14004, 13591, 11893, 9102, 5646, 2596, 757, 58, -2, 1});
constexpr Row kBand440 = row(410, {2632, 13158, 21053, 26314, 21053, 13158, 2632});
constexpr Row kBand530 = row(500, {2632, 13158, 21053, 26314, 21053, 13158, 2632});
constexpr Row kBand620 = row(590, {2632, 13158, 21053, 26314, 21053, 13158, 2632});
constexpr Row kBand630 = row(600, {2632, 13158, 21053, 26314, 21053, 13158, 2632});
constexpr Row kCcr1Red = row(570, {-21, 80, 3340, 18270, 25075, 20116, 14931, 8885, 4700, 2640, 1172, 502, 254, 57});
constexpr Row kCcr1Green = row(470, {-5, 107, 591, 4074, 10755, 16300, 18755, 17570, 13870, 9340, 5251, 2369, 779, 199, 41, 3, 1, 1});
constexpr Row kCcr2Red = row(570, {-79, 272, 6907, 22058, 25323, 18531, 11830, 7357, 4203, 1799, 1143, 429, 121, 106});
constexpr Row kCcr2Green = row(470, {36, 237, 1097, 4319, 10251, 15472, 17519, 16659, 13945, 10153, 6066, 2863, 987, 324, 71, 2, -1});
constexpr Row kCcr2Blue = row(400, {371, 1682, 4889, 9187, 12886, 15132, 15739, 14679, 11878, 7885, 4014, 1384, 273, 6, -3});

static_assert(profile(kVisual) == Profile{400, 570, 700, 9436} && sum(kVisual) == 99999);
static_assert(profile(kARed) == Profile{600, 620, 700, 32156} && sum(kARed) == 99999);
static_assert(profile(kAGreen) == Profile{500, 530, 590, 30748} && sum(kAGreen) == 100001);
static_assert(profile(kABlue) == Profile{420, 440, 500, 31698} && sum(kABlue) == 100001);
static_assert(profile(kERed) == Profile{560, 600, 700, 29979} && sum(kERed) == 100000);
static_assert(profile(kEGreen) == Profile{470, 530, 630, 18826} && sum(kEGreen) == 100001);
static_assert(profile(kEBlue) == Profile{400, 440, 530, 18654} && sum(kEBlue) == 100001);
static_assert(profile(kIRed) == Profile{610, 620, 640, 42200} && sum(kIRed) == 100000);
static_assert(profile(kIGreen) == Profile{520, 530, 550, 42200} && sum(kIGreen) == 100000);
static_assert(profile(kIBlue) == Profile{410, 430, 450, 48494} && sum(kIBlue) == 100000);
static_assert(profile(kTBlue) == Profile{400, 460, 550, 14004} && sum(kTBlue) == 99998);
static_assert(profile(kBand440) == Profile{410, 440, 470, 26314} && sum(kBand440) == 100000);
static_assert(profile(kBand530) == Profile{500, 530, 560, 26314} && sum(kBand530) == 100000);
static_assert(profile(kBand620) == Profile{590, 620, 650, 26314} && sum(kBand620) == 100000);
static_assert(profile(kBand630) == Profile{600, 630, 660, 26314} && sum(kBand630) == 100000);
static_assert(profile(kCcr1Red) == Profile{570, 610, 700, 25075} && sum(kCcr1Red) == 100001);
static_assert(profile(kCcr1Green) == Profile{470, 530, 640, 18755} && sum(kCcr1Green) == 100001);
static_assert(profile(kCcr2Red) == Profile{570, 610, 700, 25323} && sum(kCcr2Red) == 100000);
static_assert(profile(kCcr2Green) == Profile{470, 530, 630, 17519} && sum(kCcr2Green) == 100000);
static_assert(profile(kCcr2Blue) == Profile{400, 460, 540, 15739} && sum(kCcr2Blue) == 100002);

// clang-format on

constexpr StatusResponses kStatusResponses[NUM_STATUSES] = {
    /* A */ {4, {0, 1, 2, 3}},
    /* E */ {4, {0, 1, 2, 3}},
    /* I */ {4, {0, 1, 2, 3}},
    /* T */ {4, {0, 1, 2, 3}},
    /* spectral */ {0, {}},
    /* SpectralX */ {0, {}},
    /* HiFi */ {7, {0, 1, 2, 3, 4, 5, 6}},
    /* Hexachrome */ {6, {0, 1, 2, 3, 7, 8}},
    /* CCR1 */ {4, {0, 1, 2, 3}},
    /* CCR2 */ {4, {0, 1, 2, 3}},
};

/// Ids ascend from the visual response; zeros fill the rest.
constexpr bool well_formed(const StatusResponses &responses)
{
    for (int i = 1; i < NUM_RESPONSES; ++i)
        if (i < responses.count ? responses.ids[i] <= responses.ids[i - 1] : responses.ids[i] != 0)
            return false;
    return responses.ids[0] == VISUAL_RESPONSE;
}
static_assert(std::all_of(std::begin(kStatusResponses), std::end(kStatusResponses), well_formed));

} // namespace

const StatusResponses &responses_of(int status) { return kStatusResponses[status]; }

Bands normalized(Weights weights, std::int64_t peak_weight)
{
    Bands result;
    for (int i = 0; i < kBands; ++i)
        result[i] = static_cast<double>(weights[i]) / static_cast<double>(peak_weight) * 100;
    return result;
}

} // namespace vantrel

using namespace vantrel;

// State: its default values are the rows above. The setters of the HiFi and Hexachrome bands, or
// the host, change it.
// clang-format off
#define WEIGHTS(r) { \
    (r)[0], (r)[1], (r)[2], (r)[3], (r)[4], (r)[5], (r)[6], (r)[7], \
    (r)[8], (r)[9], (r)[10], (r)[11], (r)[12], (r)[13], (r)[14], (r)[15], \
    (r)[16], (r)[17], (r)[18], (r)[19], (r)[20], (r)[21], (r)[22], (r)[23], \
    (r)[24], (r)[25], (r)[26], (r)[27], (r)[28], (r)[29], (r)[30]}

constinit std::int64_t den_weight[NUM_STATUSES][NUM_RESPONSES][kBands] = {
    /* A */          {WEIGHTS(kVisual), WEIGHTS(kARed), WEIGHTS(kAGreen), WEIGHTS(kABlue)},
    /* E */          {WEIGHTS(kVisual), WEIGHTS(kERed), WEIGHTS(kEGreen), WEIGHTS(kEBlue)},
    /* I */          {WEIGHTS(kVisual), WEIGHTS(kIRed), WEIGHTS(kIGreen), WEIGHTS(kIBlue)},
    /* T */          {WEIGHTS(kVisual), WEIGHTS(kERed), WEIGHTS(kEGreen), WEIGHTS(kTBlue)},
    /* spectral */   {},
    /* SpectralX */  {WEIGHTS(kVisual)},
    /* HiFi */       {WEIGHTS(kVisual), WEIGHTS(kERed), WEIGHTS(kEGreen), WEIGHTS(kEBlue),
                      WEIGHTS(kBand530), WEIGHTS(kBand630), WEIGHTS(kBand620)},
    /* Hexachrome */ {WEIGHTS(kVisual), WEIGHTS(kERed), WEIGHTS(kEGreen), WEIGHTS(kEBlue),
                      {}, {}, {}, WEIGHTS(kBand440), WEIGHTS(kBand630)},
    /* CCR1 */       {WEIGHTS(kVisual), WEIGHTS(kCcr1Red), WEIGHTS(kCcr1Green), WEIGHTS(kEBlue)},
    /* CCR2 */       {WEIGHTS(kVisual), WEIGHTS(kCcr2Red), WEIGHTS(kCcr2Green), WEIGHTS(kCcr2Blue)},
};
// clang-format on
