// Sheets beside a reference, single patches, and lists. The figures of the example were computed
// from its spectra by an independent implementation of the formulas.

#include "program.h"

namespace {

Json compared(const std::string &sample, const std::string &words = "")
{
    const Outcome done = vantrel("compare --format json " + example + " " + sample + " " + words);
    EXPECT_EQ(done.status, 0) << done.err;
    return Json::parse(done.out);
}

const Json &pair(const Json &comparison, const std::string &name)
{
    for (const Json &pair : comparison["pairs"])
        if (pair["name"] == name)
            return pair;
    throw std::out_of_range(name);
}

// The 90 % tint under the name of the solid, before the solid itself.
std::string weak() { return changed("\"Magenta 90\"", "\"Magenta 100\""); }

} // namespace

TEST(Compare, GivesTheKnownDifferences)
{
    const Json out = compared(weak(), "--formula de2000,cmc,de94,de76");
    const Json &solid = pair(out, "Magenta 100");
    for (const auto &[field, value] : {std::pair{"de2000", 1.535610384},
                                       {"cmc", 1.079203844},
                                       {"de94", 1.923059644},
                                       {"de76", 2.397148828},
                                       {"metamerism", 4.680780109},
                                       {"din6172", 0.327027981}})
        EXPECT_NEAR(solid[field], value, 1e-8) << field;
    EXPECT_EQ(solid["verbal"], "Too Light, Too Green");
    EXPECT_EQ(pair(out, "Paper")["verbal"], "On Target");
    EXPECT_EQ(solid["sample"]["id"], "10");
    EXPECT_NEAR(solid["reference"]["density"], 0.440446457, 1e-8);
    EXPECT_LT(solid["density_difference"], 0);

    EXPECT_EQ(out["statistics"]["cmc"]["max_patch"], "Magenta 100");
    EXPECT_NEAR(out["statistics"]["cmc"]["mean"], 1.079203844 / 30, 1e-9);
    EXPECT_EQ(out["statistics"]["cmc"]["p95"], 0.0); // the 29th of 30
    EXPECT_EQ(out["worst"].size(), 10u);
    EXPECT_EQ(out["pairs"][std::size_t(out["worst"][0])]["name"], "Magenta 100");
    EXPECT_EQ(out["unpaired"], Json({{"reference", {"Magenta 90"}}, {"sample", {"Magenta 100"}}}));

    const Json weighted = compared(weak(), "--formula cmc,de2000 --weights cmc=1,1 --weights "
                                           "de2000=2,1.5 --words hue");
    EXPECT_NEAR(pair(weighted, "Magenta 100")["cmc"], 1.608395421, 1e-8);
    EXPECT_NEAR(pair(weighted, "Magenta 100")["de2000"], 0.852991143, 1e-8);
    EXPECT_EQ(pair(weighted, "Magenta 100")["verbal"], "Too Light, Too Dull, Too Blue");
}

TEST(Compare, PairsByNameOrIdOrPlace)
{
    // Half of the names are enough; fewer leave it to the ids, and these to the order.
    std::string renamed = content(example), strange;
    for (int i = 1; i <= 31; ++i) {
        const auto tab = renamed.find(fmt::format("\n{}\t\"", i)) + 1;
        renamed.insert(renamed.find('"', tab) + 1, "Field ");
    }
    strange = renamed;
    for (int i = 1; i <= 31; ++i)
        strange = replaced(strange, fmt::format("\n{}\t\"", i), fmt::format("\nA{}\t\"", i));
    const std::string by_id = scratch("by_id"), by_order = scratch("by_order");
    std::ofstream(by_id) << renamed;
    std::ofstream(by_order) << strange;
    const std::string shorter = scratch("shorter");
    std::ofstream(shorter) << strange.substr(0, strange.find("\nA30\t")) << "\nEND_DATA\n";

    // Rows without names or ids have none in common with the ids 1 and 2.
    const std::string nameless = scratch("nameless");
    std::string head, row;
    for (int nm = 400; nm <= 700; nm += 10) {
        head += fmt::format("{},", nm);
        row += "50,";
    }
    std::ofstream(nameless) << head << '\n' << row << '\n' << row << '\n';

    EXPECT_EQ(compared(example)["paired_by"], "name");
    EXPECT_EQ(compared(by_id)["paired_by"], "id");
    EXPECT_EQ(compared(by_order)["paired_by"], "order");
    const Json cut = compared(shorter, "--pair order");
    EXPECT_EQ(cut["pairs"].size(), 29u);
    EXPECT_EQ(cut["unpaired"]["reference"].size(), 2u);
    for (const std::string &file : {by_id, by_order})
        EXPECT_EQ(compared(file)["statistics"]["de2000"]["max"], 0.0);

    expect_refusals(
        "compare " + example,
        {{shorter, example + " has 31 patches and " + shorter + " has 29, most without"},
         {nameless, example + " has 31 patches and " + nameless + " has 2, most"},
         {by_order + " --pair name", "no patch of " + example + " has a partner in "},
         {example + " --formula de2001", "no formula \"de2001\"; there are de2000"},
         {example + " --formula cmc,CMC", "the formula cmc is named twice"},
         {example + " --weights cmc=2,1", "--weights of cmc, which --formula does not"},
         {example + " --weights de2000=0,1", "--weights takes two numbers above 0"},
         {example + " --weights 2,1", "--weights takes FORMULA=LIGHTNESS,CHROMA"},
         {example + " --tolerance=-1", "--tolerance takes a number from 0 up"},
         {example + " --tolerance nan", "--tolerance takes a number from 0 up"},
         {"/nowhere", "/nowhere: No such file or directory"}});
}

TEST(Compare, TellsByItsExitStatusWhetherTheSheetPasses)
{
    const std::string words = "compare " + example + " " + weak() + " --formula de76,de2000 ";
    for (const char *format : {"table", "csv", "json", "cgats"}) {
        const std::string with_format = fmt::format("{} --format {} --tolerance ", words, format);
        EXPECT_EQ(vantrel(with_format + "2.3971").status, 1) << format; // the first formula decides
        EXPECT_EQ(vantrel(with_format + "2.3972").status, 0) << format;
    }
    EXPECT_EQ(vantrel(words + "--tolerance 1 -o /dev/full").status, 3);
    EXPECT_EQ(vantrel("compare --tolerance 0 " + example + " " + example).status, 0);
    const Outcome failed = vantrel(words + "--tolerance 2");
    EXPECT_NE(failed.out.find("\nFailed: 1 of 30 pairs are above ΔE*ab 2\n"), std::string::npos);
    EXPECT_NE(failed.out.find("\nWithout a partner in " + example + ": Magenta 90\n"),
              std::string::npos);
    EXPECT_EQ(std::count(failed.err.begin(), failed.err.end(), '\n'), 2) << failed.err;
    EXPECT_EQ(compared(weak(), "--tolerance 9")["passed"], true);
    EXPECT_TRUE(compared(weak())["passed"].is_null());
}

TEST(Ink, TellsEverythingAboutAPatch)
{
    const Json ink = json_of("--patch 'Magenta 90' --against 11 " + example, "ink");
    EXPECT_EQ(ink["statuses"].size(), 10u);
    EXPECT_EQ(ink["illuminants"].size(), 18u);
    const Json &other = ink["against"];
    EXPECT_NEAR(other["a_weights"][4], 71.165922935, 1e-8);
    EXPECT_NEAR(other["b_weights"][5], -100, 1e-12);
    EXPECT_NEAR(other["de00"], 1.535610384, 1e-8);
    EXPECT_NEAR(ink["illuminants"][0]["metamerism"], 4.680780109, 1e-8);
    EXPECT_NEAR(ink["illuminants"][11]["against_lab"][0], 70.564319600, 1e-8);

    const Json solid = json_of("--patch 'Magenta 100' " + example, "ink");
    EXPECT_TRUE(solid["against"].is_null());
    EXPECT_EQ(solid["illuminants"][11]["lab"], ink["illuminants"][11]["against_lab"]);
    const Json &statuses = solid["statuses"];
    EXPECT_NEAR(statuses[6]["densities"]["HiFi 1"], 0.466832166, 1e-8);
    EXPECT_NEAR(statuses[7]["densities"]["Hexachrome 1"], 0.283704271, 1e-8);
    EXPECT_NEAR(statuses[9]["densities"]["Visual"], 0.369332067, 1e-8);
    EXPECT_EQ(statuses[1]["densities"].size(), 4u);
    EXPECT_EQ(statuses[4]["densities"], Json::object());
    EXPECT_NEAR(statuses[4]["density"], 0.451153846, 1e-8);
    EXPECT_NEAR(json_of("--patch Paper " + example, "ink")["whiteness"], 84.264679379, 1e-8);
    expect_refusals("ink " + example, {{"--patch Card", example + " holds no patch \"Card\""},
                                       {"--patch Paper --against Card", example + " holds no"},
                                       {"", "--patch is required"}});

    const std::string written = scratch("ink.txt");
    ASSERT_EQ(
        vantrel("ink --patch 2 --against 3 --format cgats -o " + written + " " + example).status,
        0);
    EXPECT_EQ(json_of(written)["patches"][1]["refl"],
              patch(json_of(example), "Magenta 20")["refl"]);
}

TEST(List, GivesNamesAndTables)
{
    const auto rows = [](const std::string &words) { return json_of(words, "list")["rows"]; };
    EXPECT_EQ(rows("statuses").size(), 10u);
    const Json illuminants = rows("illuminants");
    EXPECT_EQ(illuminants.size(), 18u);
    EXPECT_EQ(illuminants[4]["illuminant"], "D50_2DEG");
    double sum = 0;
    for (const Json &band : rows("illuminants --illuminant D50_2DEG"))
        sum += double(band["X"]);
    EXPECT_NEAR(sum, illuminants[4]["X"], 1e-9);
    EXPECT_EQ(rows("responses").size(), 4u * 8 + 3 + 2);
    EXPECT_EQ(rows("responses --status HIFI").size(), 7u);
    const Json green = rows("weights --response g");
    EXPECT_EQ(green[13]["Green"], 100.0);
    EXPECT_NEAR(green[12]["Green"], 90.497184745, 1e-8);
    EXPECT_FALSE(green[12].contains("Red"));
    expect_refusals("list", {{"weights --status SPECTRAL", "SPECTRAL_STATUS has no such filter"},
                             {"weights --response H1", "E_STATUS has no such filter"},
                             {"weights --response Pink", "no response \"Pink\"; there are Visual"},
                             {"lamps", ""}});
}
