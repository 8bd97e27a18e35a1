#pragma once

#include <array>
#include <iterator>

namespace vantrel {

inline constexpr int kDisplaySteps = 1000;

struct LevelStart {
    int index;
    unsigned char level;
};

// Drive level of the preview display by linear intensity in thousandths: the index at which each
// level begins.
// clang-format off
inline constexpr LevelStart kLevelStarts[] = {
    {0, 0}, {4, 5}, {5, 10}, {6, 15}, {7, 20}, {8, 25}, {9, 30}, {10, 35}, {11, 40}, {12, 41},
    {13, 48}, {14, 50}, {15, 55}, {16, 56}, {17, 58}, {18, 60}, {19, 63}, {20, 64}, {21, 65},
    {22, 67}, {23, 69}, {24, 70}, {25, 71}, {26, 72}, {27, 73}, {28, 74}, {29, 75}, {30, 76},
    {31, 77}, {32, 78}, {33, 79}, {35, 80}, {36, 81}, {37, 82}, {38, 83}, {40, 84}, {41, 85},
    {42, 86}, {43, 87}, {45, 88}, {47, 89}, {48, 90}, {50, 91}, {51, 92}, {52, 93}, {54, 94},
    {56, 95}, {58, 96}, {60, 97}, {62, 98}, {63, 99}, {65, 100}, {67, 101}, {69, 102}, {71, 103},
    {73, 104}, {75, 105}, {77, 106}, {79, 107}, {81, 108}, {84, 109}, {86, 110}, {88, 111},
    {91, 112}, {94, 113}, {96, 114}, {98, 115}, {101, 116}, {104, 117}, {106, 118}, {109, 119},
    {112, 120}, {115, 121}, {118, 122}, {121, 123}, {124, 124}, {127, 125}, {130, 126}, {133, 127},
    {136, 128}, {139, 129}, {143, 130}, {146, 131}, {149, 132}, {153, 133}, {156, 134}, {159, 135},
    {163, 136}, {167, 137}, {171, 138}, {174, 139}, {178, 140}, {182, 141}, {186, 142}, {189, 143},
    {193, 144}, {198, 145}, {202, 146}, {206, 147}, {211, 148}, {215, 149}, {219, 150}, {224, 151},
    {228, 152}, {233, 153}, {237, 154}, {242, 155}, {246, 156}, {251, 157}, {255, 158}, {260, 159},
    {265, 160}, {270, 161}, {275, 162}, {280, 163}, {285, 164}, {291, 165}, {296, 166}, {301, 167},
    {306, 168}, {312, 169}, {317, 170}, {323, 171}, {328, 172}, {334, 173}, {340, 174}, {346, 175},
    {351, 176}, {357, 177}, {363, 178}, {369, 179}, {374, 180}, {380, 181}, {387, 182}, {393, 183},
    {399, 184}, {405, 185}, {412, 186}, {418, 187}, {425, 188}, {432, 189}, {438, 190}, {445, 191},
    {452, 192}, {459, 193}, {465, 194}, {472, 195}, {479, 196}, {486, 197}, {493, 198}, {501, 199},
    {508, 200}, {515, 201}, {523, 202}, {531, 203}, {538, 204}, {545, 205}, {552, 206}, {560, 207},
    {568, 208}, {575, 209}, {583, 210}, {590, 211}, {599, 212}, {606, 213}, {614, 214}, {622, 215},
    {630, 216}, {639, 217}, {647, 218}, {655, 219}, {664, 220}, {673, 221}, {682, 222}, {690, 223},
    {698, 224}, {707, 225}, {716, 226}, {725, 227}, {735, 228}, {743, 229}, {752, 230}, {761, 231},
    {769, 232}, {779, 233}, {787, 234}, {797, 235}, {806, 236}, {814, 237}, {824, 238}, {834, 239},
    {844, 240}, {853, 241}, {863, 242}, {873, 243}, {882, 244}, {892, 245}, {902, 246}, {912, 247},
    {922, 248}, {932, 249}, {942, 250}, {952, 251}, {963, 252}, {974, 253}, {984, 254}, {994, 255},
};
// clang-format on

constexpr std::array<unsigned char, kDisplaySteps> display_levels()
{
    std::array<unsigned char, kDisplaySteps> levels{};
    const LevelStart *start = kLevelStarts;
    for (int i = 0; i < kDisplaySteps; ++i) {
        if (start + 1 != std::end(kLevelStarts) && start[1].index == i)
            ++start;
        levels[i] = start->level;
    }
    return levels;
}

inline constexpr std::array<unsigned char, kDisplaySteps> kDisplayLevels = display_levels();

constexpr bool starts_rise()
{
    for (std::size_t i = 1; i < std::size(kLevelStarts); ++i) {
        const LevelStart &before = kLevelStarts[i - 1];
        const LevelStart &start = kLevelStarts[i];
        if (start.index <= before.index || start.level <= before.level)
            return false;
    }
    return true;
}
static_assert(starts_rise());

// A digit that slips changes one of these sums.
constexpr int sum_of_levels(bool by_index)
{
    int sum = 0;
    for (int i = 0; i < kDisplaySteps; ++i)
        sum += kDisplayLevels[i] * (by_index ? i : 1);
    return sum;
}
static_assert(sum_of_levels(false) == 187808 && sum_of_levels(true) == 107936674);
static_assert(std::size(kLevelStarts) == 207);
static_assert(kDisplayLevels[3] == 0 && kDisplayLevels[4] == 5 && kDisplayLevels[11] == 40);
static_assert(kDisplayLevels[33] == 79 && kDisplayLevels[34] == 79 && kDisplayLevels[35] == 80);
static_assert(kDisplayLevels[993] == 254 && kDisplayLevels[994] == 255);

} // namespace vantrel
