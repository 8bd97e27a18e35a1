// Predicted tints and overprints. The figures of the example were computed from its spectra by an
// independent implementation of the formulas.

#include "program.h"

namespace {

Json predictions(const std::string &words) { return json_of(words, "predict"); }

Json only(const std::string &words)
{
    const Json out = predictions(words)["predictions"];
    EXPECT_EQ(out.size(), 1u) << words;
    return out[0];
}

void expect_lab(const Json &estimate, double L, double a, double b)
{
    EXPECT_NEAR(estimate["lab"][0], L, 1e-6);
    EXPECT_NEAR(estimate["lab"][1], a, 1e-6);
    EXPECT_NEAR(estimate["lab"][2], b, 1e-6);
}

} // namespace

TEST(Predict, GivesBothModelsBesideWhatWasMeasured)
{
    // The solid by name, by id, or the ink by its device field.
    for (const std::string inks :
         {"--ink 'Magenta 100:50' --ink 'Yellow 100:50' ", "--ink 11:50 --ink cmyk_y:50 "}) {
        const Json overprint = only(inks + example);
        EXPECT_EQ(overprint["inks"], Json({{{"name", "Magenta 100"}, {"percent", 50}},
                                           {{"name", "Yellow 100"}, {"percent", 50}}}));
        expect_lab(overprint["halftone"], 84.684990579, 8.354689475, 10.617277378);
        EXPECT_NEAR(overprint["halftone"]["de00_to_measured"], 10.092995847, 1e-6);
        EXPECT_NEAR(overprint["halftone"]["refl"][15], 59.352, 1e-9);
        expect_lab(overprint["film"], 80.780047533, 12.344887409, 21.830411050);
        EXPECT_NEAR(overprint["film"]["de00_to_measured"], 3.777244109, 1e-6);
        EXPECT_NEAR(overprint["film"]["refl"][15], 48.331592350, 1e-8);
        EXPECT_EQ(overprint["halftone"]["refl"].size(), 31u);
        EXPECT_EQ(overprint["measured"]["name"], "Magenta 50 Yellow 50");
        EXPECT_NEAR(overprint["measured"]["lab"][0], 76.31, 0.005);
    }
    const Json tint = only("--ink CMYK_M:30 " + example);
    expect_lab(tint["halftone"], 89.369053770, 6.426552238, 0.459241909);
    EXPECT_NEAR(tint["film"]["de00_to_measured"], 1.328403317, 1e-6);
    EXPECT_EQ(tint["measured"]["name"], "Magenta 30");

    const Json unmeasured = only("--ink CMYK_M:40 --ink CMYK_Y:70 " + example);
    expect_lab(unmeasured["film"], 82.733292325, 7.659956600, 35.998515124);
    EXPECT_TRUE(unmeasured["measured"].is_null());
    EXPECT_TRUE(unmeasured["film"]["de00_to_measured"].is_null());
}

TEST(Predict, FollowsPaperIlluminantAndOrder)
{
    // A tint of nothing is the paper, and a combination is found in any order of its inks.
    const Json paper = only("--paper 'Yellow 10' --illuminant A_10DEG --ink CMYK_M:0 " + example);
    const Json report = json_of("--illuminant A_10DEG " + example);
    EXPECT_EQ(paper["halftone"]["lab"], patch(report, "Yellow 10")["lab"]);
    EXPECT_EQ(paper["measured"]["name"], "Paper"); // bare
    const Json turned = only("--ink CMYK_Y:50 --ink CMYK_M:50 --order CMYK_Y " + example);
    EXPECT_EQ(turned["measured"]["name"], "Magenta 50 Yellow 50");
    EXPECT_EQ(turned["inks"][0]["name"], "Yellow 100");
    const Json all = predictions("--order CMYK_Y " + example);
    EXPECT_EQ(all["predictions"][0]["inks"][0]["name"], "Yellow 100");

    // Without device values any patch is an ink, and nothing counts as its measurement.
    const std::string plain = changed("CMYK_M\tCMYK_Y", "INK_M\tINK_Y");
    const Json three =
        only("--ink 'Yellow 100:100' --ink 'Magenta 100:60' --ink 'Yellow 80:30' " + plain);
    expect_lab(three["halftone"], 81.328905946, 5.572539628, 47.185553556);
    EXPECT_TRUE(three["measured"].is_null());
}

TEST(Predict, ComparesEveryMeasuredOverprint)
{
    const Json all = predictions(example);
    EXPECT_EQ(all["left_out"], 0);
    ASSERT_EQ(all["predictions"].size(), 10u);
    double halftone = 0, film = 0;
    for (std::size_t i = 0; i < 10; ++i) {
        const Json &one = all["predictions"][i];
        EXPECT_EQ(one["inks"][0]["percent"], 10 * (i + 1));
        EXPECT_EQ(one["measured"]["name"].get<std::string>().substr(0, 7), "Magenta");
        halftone += one["halftone"]["de00_to_measured"].get<double>() / 10;
        film += one["film"]["de00_to_measured"].get<double>() / 10;
    }
    EXPECT_NEAR(halftone, 8.904213184, 1e-6);
    EXPECT_NEAR(film, 5.014845368, 1e-6);

    const Outcome table = vantrel("predict " + example);
    EXPECT_NE(
        table.out.find(
            "\nMagenta 50 Yellow 50     84.68   8.35  10.62  10.09   80.78  12.34  21.83   3.78   "
            "76.31  11.70  25.05\n"),
        std::string::npos)
        << table.out;
    EXPECT_NE(table.out.find("\nHalftone: mean ΔE00 8.90, largest 10.17\n"
                             "Film: mean ΔE00 5.01, largest 9.01\n"),
              std::string::npos);
}

TEST(Predict, LeavesOutWhatTheModelsDoNotTake)
{
    const std::string file = changed("Yellow 10\"\t10\t10", "Yellow 10\"\t10.5\t10");
    const Json all = predictions(file);
    EXPECT_EQ(all["left_out"], 1);
    EXPECT_EQ(all["predictions"].size(), 9u);
    EXPECT_NE(vantrel("predict " + file).out.find("\nLeft out: 1 overprints"), std::string::npos);
    EXPECT_EQ(vantrel("predict " + changed("\"Magenta 100\"\t100", "\"Magenta 100\"\t99")).status,
              2); // no solid, so no overprint
}

TEST(Predict, RefusesBadRequestsInOneLine)
{
    const std::string whole = "--ink takes a whole percentage from 0 to 100, not ";
    expect_refusals("predict " + example,
                    {{"--ink CMYK_M", "--ink takes NAME:PERCENT, not \"CMYK_M\""},
                     {"--ink CMYK_M:", whole + "\"\""},
                     {"--ink CMYK_M:101", whole + "\"101\""},
                     {"--ink CMYK_M:-1", whole + "\"-1\""},
                     {"--ink CMYK_M:12.5", whole + "\"12.5\""},
                     {"--ink CMYK_M:1e99", whole + "\"1e99\""},
                     {"--ink CMYK_M:nan", whole + "\"nan\""},
                     {"--ink Cyan:50", example + " holds no patch \"Cyan\"; its patches are"},
                     {"--ink :50", example + " holds no patch \"\""},
                     {"--ink Paper:50", example + ": \"Paper\" is no solid of one ink"},
                     {"--ink 'Magenta 50:50'", example + ": \"Magenta 50\" is no solid"},
                     {"--ink 11:50 --ink CMYK_M:20", "the ink \"Magenta 100\" is named twice"},
                     {"--ink 11:1 --ink 21:1 --ink 11:1 --ink 21:1", ""},
                     {"--status B", "no status \"B\""},
                     {"--ink", ""}});
    const std::string none = changed("\"Magenta 100\"\t100", "\"Magenta 100\"\t99");
    expect_refusals("predict " + none, {{"--ink CMYK_M:5", none + " holds no solid of \"CMYK_M\""},
                                        {"", none + " holds no overprint of two or three inks"}});
}
