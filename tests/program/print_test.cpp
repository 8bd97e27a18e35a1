// Densities, print attributes and paper measures of a report. The figures of the example were
// computed from its spectra by an independent implementation of the formulas.

#include <sstream>

#include "program.h"

namespace {

// The fields of a patch that are missing where they make no sense, each with a letter.
std::string present(const Json &row)
{
    std::string out;
    for (const auto &[field, letter] : {std::pair{"density", 'd'},
                                        {"dot_area", 'a'},
                                        {"dot_gain", 'g'},
                                        {"print_contrast", 'c'},
                                        {"hue_error", 'h'},
                                        {"grayness", 'y'},
                                        {"trap", 't'}})
        if (!row.at(field).is_null())
            out += letter;
    return out;
}

std::vector<std::string> lines_of(const std::string &text)
{
    std::vector<std::string> lines;
    std::istringstream in(text);
    for (std::string line; std::getline(in, line);)
        lines.push_back(line);
    return lines;
}

std::size_t characters(const std::string &text)
{
    return std::count_if(text.begin(), text.end(), [](char c) { return (c & 0xC0) != 0x80; });
}

} // namespace

TEST(Print, GivesTheKnownAttributesOfTheExample)
{
    const struct {
        std::string words;
        std::string patch;
        const char *field;
        double value;
    } known[] = {
        {"", "Magenta 100", "density", 0.440446457},
        {"", "Magenta 50", "dot_area", 68.617341855},
        {"", "Magenta 50", "dot_gain", 18.617341855},
        {"", "Magenta 80", "print_contrast", 16.318025066},
        {"", "Magenta 100", "hue_error", 46.338438453},
        {"", "Magenta 100", "grayness", 34.362617304},
        {"", "Yellow 100", "density", 0.730596405},
        {"", "Yellow 50", "dot_gain", 19.131409483},
        {"", "Magenta 100 Yellow 100", "trap", 68.100457584},
        {"--n-factor 1.7", "Magenta 50", "dot_area", 63.870760705},
        {"--status t_status", "Yellow 100", "density", 0.562215527},
        {"--status T", "Yellow 50", "dot_gain", 15.602811605},
        {"--status T", "Yellow 80", "print_contrast", 19.520466373},
        {"--status T", "Magenta 100 Yellow 100", "trap", 65.605756266},
        {"--status CCR2_STATUS", "Yellow 50", "dot_gain", 18.016912638},
        {"--status CCR2_STATUS", "Magenta 100", "hue_error", 53.892140356},
        // The second ink is read in its own response, whichever it is.
        {"--order CMYK_Y", "Magenta 100 Yellow 100", "trap", 66.937739036},
        {"--order 'Yellow 100,cmyk_m'", "Magenta 100 Yellow 100", "trap", 66.937739036},
        {"--order 11,21", "Magenta 100 Yellow 100", "trap", 68.100457584},
        // A wavelength is read over the paper like a filter.
        {"--status SPECTRAL", "Magenta 100", "density", 0.451153846},
        {"--status SPECTRAL", "Magenta 50", "dot_area", 67.474212336},
    };
    for (const auto &[words, name, field, value] : known)
        EXPECT_NEAR(patch(json_of(fmt::format("{} {}", words, example)), name)[field], value, 1e-8)
            << words << ", " << name << ": " << field;
}

TEST(Print, FindsTheResponseOfEachInkUnderEveryStatus)
{
    const struct {
        const char *status;
        const char *magenta;
        int magenta_id;
        double magenta_density;
        const char *yellow;
        const char *code; // of the magenta, in the table
    } known[] = {
        {"A_STATUS", "Green", 2, 0.478009, "Blue", "G"},
        {"E_STATUS", "Green", 2, 0.440446, "Blue", "G"},
        {"I_STATUS", "Green", 2, 0.500942, "Blue", "G"},
        {"T_STATUS", "Green", 2, 0.440446, "Blue", "G"},
        {"SPECTRAL_STATUS", "520 nm", 520, 0.451154, "420 nm", "520"},
        {"SPECTRALX_STATUS", "band 15", 15, 0.459943, "band 4", "b15"},
        {"HIFI_STATUS", "HiFi 1", 4, 0.466832, "Blue", "H1"},
        {"HEXACHROME_STATUS", "Green", 2, 0.440446, "Blue", "G"},
        {"CCR1_STATUS", "Green", 2, 0.440784, "Blue", "G"},
        {"CCR2_STATUS", "Green", 2, 0.456811, "Blue", "G"},
    };
    for (const auto &row : known) {
        const std::string words = fmt::format("--status {} {}", row.status, example);
        const Json sheet = json_of(words);
        EXPECT_EQ(sheet["status"], row.status);
        const Json &magenta = patch(sheet, "Magenta 100");
        EXPECT_EQ(magenta["response"], row.magenta);
        EXPECT_EQ(magenta["response_id"], row.magenta_id);
        EXPECT_NEAR(magenta["density"], row.magenta_density, 5e-7) << row.status;
        EXPECT_EQ(patch(sheet, "Yellow 100")["response"], row.yellow);
        EXPECT_NEAR(patch(sheet, "Paper")["density"], 0, 1e-12) << row.status;
        EXPECT_EQ(present(magenta), row.magenta_id >= 9 ? "d" : "dhy") << row.status;
        const std::string cells =
            fmt::format("27.27{:>4}{:>7.3f}\n", row.code, row.magenta_density);
        EXPECT_NE(vantrel("report " + words).out.find(cells), std::string::npos) << cells;
    }
}

TEST(Print, LeavesBlankWhatMakesNoSense)
{
    const Json sheet = json_of(example);
    for (const auto &[name, fields] : {std::pair{"Paper", "d"},
                                       {"Magenta 10", "dag"},
                                       {"Magenta 70", "dag"},
                                       {"Magenta 80", "dagc"},
                                       {"Magenta 100", "dhy"},
                                       {"Magenta 50 Yellow 50", "d"},
                                       {"Magenta 100 Yellow 100", "dt"}})
        EXPECT_EQ(present(patch(sheet, name)), fields) << name;

    const struct {
        const char *from;
        const char *to;
        const char *patch;
        const char *fields;
    } cases[] = {
        {"\"Magenta 80\"\t80", "\"Magenta 80\"\t75", "Magenta 80", "dagc"},
        {"\"Magenta 80\"\t80", "\"Magenta 80\"\t74.9", "Magenta 80", "dag"},
        {"\"Magenta 80\"\t80", "\"Magenta 80\"\t80.5", "Magenta 80", "dag"},
        {"\"Magenta 50\"\t50", "\"Magenta 50\"\t128", "Magenta 50", "d"},
        {"\"Magenta 50\"\t50", "\"Magenta 50\"\t-1", "Magenta 50", "d"},
        {"\"Magenta 100\"\t100", "\"Magenta 100\"\t99", "Magenta 50", "d"}, // no solid any more
        {"\"Magenta 100\"\t100", "\"Magenta 100\"\t99", "Magenta 100 Yellow 100", "d"},
        {"\"Yellow 100\"\t0\t100", "\"Yellow 100\"\t1\t100", "Magenta 100 Yellow 100", "d"},
        {"CMYK_M\tCMYK_Y", "RGB_R\tRGB_G", "Magenta 50", "d"}, // what a screen shows is no ink
        {"CMYK_M\tCMYK_Y", "6CLR_1\t6CLR_5", "Magenta 50", "dag"},
    };
    for (const auto &row : cases)
        EXPECT_EQ(present(patch(json_of(changed(row.from, row.to)), row.patch)), row.fields)
            << row.to;

    // A "solid" that is the paper has no density to compare with.
    EXPECT_EQ(present(patch(json_of("--paper 'Magenta 100' " + example), "Magenta 50")), "d");
    EXPECT_EQ(json_of(data + "pairs_decimal_comma.txt")["inks"], Json::array());
}

TEST(Print, TakesNominalTintsAsTheyAre)
{
    const Json fraction = json_of(changed("\"Magenta 50\"\t50", "\"Magenta 50\"\t49.5"));
    EXPECT_NEAR(patch(fraction, "Magenta 50")["dot_gain"], 19.117341855, 1e-8);
    const Json loss = json_of(changed("\"Magenta 50\"\t50", "\"Magenta 50\"\t70"));
    EXPECT_NEAR(patch(loss, "Magenta 50")["dot_area"], 68.617341855, 1e-8);
    EXPECT_EQ(patch(loss, "Magenta 50")["dot_gain"], 0.0); // a gain is never negative
    // The mean of two tints of one nominal value stands in the curve, whose means are the patches'.
    const Json repeated = json_of(changed("\"Magenta 50\"\t50", "\"Magenta 50\"\t40"));
    const Json &curve = repeated["tone_values"][0];
    EXPECT_EQ(curve["solid"], "Magenta 100");
    EXPECT_EQ(curve["values"].size(), 8u);
    EXPECT_EQ(curve["values"][3]["patches"], 2);
    EXPECT_NEAR(2 * double(curve["values"][3]["dot_area"]),
                double(patch(repeated, "Magenta 40")["dot_area"]) +
                    double(patch(repeated, "Magenta 50")["dot_area"]),
                1e-9);
    // The first of two solids counts.
    const Json twice = json_of(changed("\"Magenta 90\"\t90", "\"Magenta 90\"\t100"));
    EXPECT_GT(patch(twice, "Magenta 50")["dot_area"], 70);
}

TEST(Paper, IsMeasuredWithTheReasonWhereThereIsNoWhiteness)
{
    const Json paper = json_of(example)["paper"];
    EXPECT_NEAR(paper["brightness"], 87.26738623, 1e-8);
    EXPECT_NEAR(paper["whiteness"], 84.264679379, 1e-6);
    EXPECT_NEAR(paper["lab"][0], 95.48, 0.005);
    EXPECT_FALSE(paper.contains("no_whiteness") || paper.contains("metamerism"));
    EXPECT_NEAR(json_of("--illuminant C_10DEG " + example)["paper"]["whiteness"], 83.513903134,
                1e-6);

    const std::string lamp = "under A_2DEG: ASTM E313 has C, D50 and D65 alone";
    EXPECT_EQ(json_of("--illuminant A_2DEG " + example)["paper"]["no_whiteness"], lamp);
    EXPECT_NE(vantrel("report --illuminant A_2DEG " + example).out.find("whiteness none (" + lamp),
              std::string::npos);
    const Json yellow = json_of("--paper 'Yellow 100' " + example)["paper"];
    EXPECT_TRUE(yellow["whiteness"].is_null());
    EXPECT_EQ(yellow["no_whiteness"], "outside its limits, 40 < W < 5 Y - 280");
}

TEST(Paper, IsComparedWithASecondUnderTwoIlluminants)
{
    const struct {
        std::string words;
        const char *illuminant;
        double sum;
    } known[] = {
        {"", "A_2DEG", 12.617885323},
        {"--illuminant D50_10DEG", "A_10DEG", 12.957305164},
        {"--illuminant A_2DEG", "D65_2DEG", 12.954304015},
        {"--illuminant D65_2DEG --second-illuminant a_2deg", "A_2DEG", 12.954304015},
    };
    for (const auto &[words, illuminant, sum] : known) {
        const Json sheet = json_of(fmt::format("{} --second-paper 'Yellow 10' {}", words, example));
        const Json &metamerism = sheet["paper"]["metamerism"];
        EXPECT_EQ(metamerism["paper"], "Yellow 10");
        EXPECT_EQ(metamerism["illuminant"], illuminant) << words;
        EXPECT_NEAR(metamerism["sum"], sum, 1e-6) << words;
    }
    EXPECT_NE(vantrel("report --second-paper 12 " + example)
                  .out.find("\nMetamerism against Yellow 10: 12.62 (ΔE*ab under D50_2DEG plus "
                            "A_2DEG), DIN 6172 1.20\n"),
              std::string::npos);
}

TEST(Print, TablesTheSheet)
{
    const std::string out = vantrel("report " + example).out;
    EXPECT_NE(
        out.find("\nMagenta 50                80.74   18.99   -2.23   19.12  353.30   20.07   "
                 "G  0.250  68.62  18.62\n"),
        std::string::npos);
    const std::string tail = R"(
Paper: brightness 87.27, whiteness 84.26, L*a*b* 95.48 0.04 1.11

Solids                   hue error    grayness     density
Magenta 100                  46.34       34.36       0.440
Yellow 100                   12.56        3.96       0.731

Overprints                    trap
Magenta 100 Yellow 100       68.10

Shadows                   contrast
Magenta 80                   16.32
Yellow 80                    20.08

Tone values          CMYK_M          CMYK_Y
    nominal     area   gain     area   gain
         10    12.73   2.73    15.90   5.90
         20    28.22   8.22    31.10  11.10
         30    42.92  12.92    44.75  14.75
         40    56.00  16.00    57.37  17.37
         50    68.62  18.62    69.13  19.13
         60    78.75  18.75    77.60  17.60
         70    85.48  15.48    86.69  16.69
         80    89.76   9.76    90.82  10.82
         90    94.89   4.89    96.18   6.18

Inks print in the order CMYK_M, CMYK_Y
)";
    EXPECT_EQ(out.substr(out.size() - tail.size()), tail);

    const std::string name = "Bogenoffset, Prüfstreifen links, Feld 17, gestrichen matt";
    const std::string wide = changed("\"Magenta 100\"", '"' + name + '"');
    for (const std::string command : {"report ", "predict "})
        for (const std::string &line : lines_of(vantrel(command + wide).out)) {
            EXPECT_LE(characters(line), 120u) << line;
            EXPECT_FALSE(line.ends_with(' ')) << line;
        }
}

TEST(Print, RefusesBadRequestsInOneLine)
{
    expect_refusals("report " + example,
                    {{"--status B", "no status \"B\"; there are A_STATUS, E_STATUS, "},
                     {"--n-factor 0", "--n-factor takes a number above 0"},
                     {"--n-factor=-1", "--n-factor takes a number above 0"},
                     {"--n-factor nan", "--n-factor takes a number above 0"},
                     {"--n-factor inf", "--n-factor takes a number above 0"},
                     {"--n-factor two", ""},
                     {"--second-paper Card", example + " holds no patch \"Card\""},
                     {"--second-paper 2 --second-illuminant D5", "no illuminant \"D5\""},
                     {"--order CMYK_C", example + " holds no ink \"CMYK_C\"; its inks are CMYK_M, "
                                                  "CMYK_Y"},
                     {"--order 'Magenta 50'", example + " holds no ink \"Magenta 50\""},
                     {"--order CMYK_M,11", "the ink \"11\" is named twice"}});
    expect_refusals(
        "report " + data + "pairs_decimal_comma.txt",
        {{"--order CMYK_C", data + "pairs_decimal_comma.txt holds no ink \"CMYK_C\"; its "
                                   "inks are unknown"}});
}
