// Reading, the options that every command has, and how the program ends.

#include <cmath>

#include "program.h"

TEST(Report, GivesTheKnownColoursOfTheExample)
{
    const Json sheet = json_of(example);
    EXPECT_EQ(sheet["patches"].size(), 31u);
    EXPECT_EQ(sheet["paper"]["name"], "Paper");
    const struct {
        const char *name;
        double lab[3];
    } known[] = {{"Paper", {95.48, 0.04, 1.11}},
                 {"Magenta 100", {71.35, 29.14, -1.96}},
                 {"Yellow 100", {88.58, -1.09, 59.25}},
                 {"Magenta 100 Yellow 100", {68.25, 9.79, 32.63}}};
    for (const auto &colour : known)
        for (int i = 0; i < 3; ++i)
            EXPECT_NEAR(patch(sheet, colour.name)["lab"][i], colour.lab[i], 0.005) << colour.name;

    const Json &tint = patch(sheet, "Magenta 50 Yellow 50");
    EXPECT_EQ(tint["device"], Json({{"CMYK_M", 50.0}, {"CMYK_Y", 50.0}}));
    EXPECT_NEAR(tint["lch"][1], std::hypot(double(tint["lab"][1]), double(tint["lab"][2])), 0.01);
    EXPECT_EQ(patch(sheet, "Paper")["de00_to_paper"], 0.0);
}

TEST(Report, PrintsTablesWithSwatchesOnlyOnATerminal)
{
    const std::string row =
        "Magenta 100               71.35   29.14   -1.96   29.21  356.15   27.27   G  0.440\n";
    const Outcome plain = vantrel("report " + example);
    EXPECT_NE(plain.out.find("\n" + row), std::string::npos) << plain.out;
    EXPECT_EQ(plain.out.find('\x1b'), std::string::npos);

    const auto on_terminal = [](const std::string &words) {
        return shell("TERM=xterm script -qec '" + program + " report " + words + "' /dev/null").out;
    };
    EXPECT_NE(
        on_terminal(example).find("\nMagenta 100            \x1b[48;2;255;180;200m    \x1b[0m"),
        std::string::npos);
    EXPECT_EQ(on_terminal("--no-color " + example).find('\x1b'), std::string::npos);
}

TEST(Report, FollowsIlluminantAndPaper)
{
    const Json other = json_of("--illuminant a_10deg --paper 11 " + example);
    EXPECT_EQ(other["illuminant"], "A_10DEG");
    EXPECT_EQ(other["paper"]["name"], "Magenta 100"); // by its id
    EXPECT_EQ(patch(other, "Magenta 100")["de00_to_paper"], 0.0);
    EXPECT_GT(patch(other, "Magenta 100")["lab"][0], 73.0); // magenta is lighter under A

    // a chart that opens with an ink
    const std::string text = content(example);
    const auto first = text.find("1\t\"Paper\""), second = text.find('\n', first) + 1;
    const auto end = text.find("END_DATA\n", second);
    const std::string paper = text.substr(first, second - first);
    const std::string chart = scratch("chart.txt");
    for (const auto &[last, bare] : {std::pair{paper, ", \"Paper\" has none"}, {"", ""}}) {
        std::ofstream(chart) << text.substr(0, first) + text.substr(second, end - second) + last +
                                    text.substr(end);
        EXPECT_NE(vantrel("report " + chart)
                      .err.find(chart + ": \"Magenta 10\" stands for the paper, but has ink" +
                                bare + "; --paper chooses\n"),
                  std::string::npos);
    }
}

// The same three spectra in the habits of different programs.
TEST(Report, ReadsTheDialectsOfOtherPrograms)
{
    const Json expected = json_of(example);
    const struct {
        const char *file;
        std::vector<std::string> names;
        bool scaled;
        int bands;
        std::string warning;
    } dialects[] = {
        {"pairs_decimal_comma.txt",
         {"Paper", "Magenta 100", "Yellow 100"},
         true,
         36,
         "vantrel: FILE:5: NUMBER_OF_FIELDS is 72, but 73 follow\n"},
        {"tabs_latin1_cr.txt",
         {"Papier weiß, matt", "Rot �[31m \"kräftig\"", "=Gelb� 100"},
         false,
         31,
         ""},
    };
    for (const auto &dialect : dialects) {
        const std::string file = data + dialect.file;
        const Outcome done = vantrel("report --format json " + file);
        ASSERT_EQ(done.status, 0) << done.err;
        std::string warnings = dialect.warning;
        for (std::size_t at; (at = warnings.find("FILE")) != std::string::npos;)
            warnings.replace(at, 4, file);
        EXPECT_EQ(done.err, warnings);
        const Json sheet = Json::parse(done.out)["sheets"][0];
        EXPECT_EQ(sheet["source"]["scaled_to_percent"], dialect.scaled) << file;
        EXPECT_EQ(sheet["source"]["bands"], dialect.bands) << file;
        ASSERT_EQ(sheet["patches"].size(), 3u) << file;
        const char *same[] = {"Paper", "Magenta 100", "Yellow 100"};
        for (int i = 0; i < 3; ++i) {
            EXPECT_EQ(sheet["patches"][i]["name"], dialect.names[i]);
            for (int k = 0; k < 3; ++k)
                EXPECT_NEAR(sheet["patches"][i]["lab"][k], patch(expected, same[i])["lab"][k], 1e-9)
                    << file;
        }
    }
    const Outcome csv = vantrel("report --format csv " + data + "tabs_latin1_cr.txt");
    EXPECT_NE(csv.out.find(",A1,\"Papier weiß, matt\",#fffffc,95.4850,0.0428,1.1122,"),
              std::string::npos);
    EXPECT_NE(csv.out.find(",A2,\"Rot �[31m \"\"kräftig\"\"\",#"), std::string::npos);
}

TEST(Report, RefusesBadFilesInOneLine)
{
    const std::string good = content(example);
    const struct {
        std::string text;
        const char *complaint; // after the file's name
    } cases[] = {
        {good + '\0', ": not a text file"},
        {good.substr(0, good.size() / 2), ":25: 5 values in a row of 35 fields"},
        {good.substr(0, good.rfind("END_DATA")), ":41: the file ends before END_DATA"},
        {good.substr(0, good.find("1\t\"Paper\"")) + "END_DATA\n", ": no spectra in this file"},
        {replaced(good, "\t79.930\t", "\t79.930\t7\t"), ":12: more values in a row of 35 fields"},
        {replaced(good, "\t79.930\t", "\t\t"), ":12: SPECTRAL_NM400 is \"\", not a number"},
        {replaced(good, "79.930", "nan"), ":12: SPECTRAL_NM400 is \"nan\", not a number"},
        {replaced(good, "79.930", "7\x1b[2J9"), ":12: SPECTRAL_NM400 is \"7�[2J9\", not a number"},
        {replaced(good, "79.930", "1e999"), ":12: SPECTRAL_NM400 is \"1e999\", not a number"},
        {replaced(good, "\"Magenta 10\"\t10", "\"Magenta 10\"\tten"),
         ":12: CMYK_M is \"ten\", not a number"},
        {replaced(good, "\"Magenta 10\"", "\"Magenta 10"), ":12: a quoted text is not closed"},
        {replaced(good, "SPECTRAL_NM410", "R_400"), ":7: 400 nm occurs twice in a spectrum"},
        {"SPECTRAL_NORM 1e-320\n" + good, ":12: a value is too large in percent"},
        {replaced(good, "79.930", "-1e7"), ":12: a value is too large in percent"},
        {replaced(content(data + "pairs_decimal_comma.txt"), "\t700\t", "\t712\t"),
         ":11: the range is too short in spectra of 36 values from 380 to 730 nm; every 10 nm from "
         "400 to 700 is needed, or finer steps"},
    };
    const std::string file = scratch("bad.txt");
    for (const auto &bad : cases) {
        std::ofstream(file, std::ios::binary) << bad.text;
        const Outcome done = vantrel("report " + file);
        EXPECT_EQ(done.err, "vantrel: " + file + bad.complaint + "\n");
        EXPECT_EQ(done.out, "");
        EXPECT_EQ(done.status, 2);
    }
    EXPECT_EQ(vantrel("report /nowhere").err, "vantrel: /nowhere: No such file or directory\n");
    EXPECT_EQ(vantrel("report " + data).err, "vantrel: " + data + ": Is a directory\n");
    const Outcome endless = vantrel("report /dev/zero");
    EXPECT_EQ(endless.err, "vantrel: /dev/zero: larger than 512 MiB\n");
    EXPECT_EQ(endless.status, 2);
    EXPECT_EQ(
        shell("tail -n +2 " + data + "conditions.cxf | " + program + " report --condition M2 -")
            .err,
        "vantrel: -: no spectra under M2; the file has M0, M1\n");
    EXPECT_NE(vantrel("report --scale percent " + data + "conditions.cxf")
                  .out.find(" nm, M1; in percent (by --scale)\n"),
              std::string::npos);
}

TEST(Program, NamesWhatARequestMayHold)
{
    const Outcome lamp = vantrel("report --illuminant D51 " + example);
    EXPECT_EQ(lamp.status, 2);
    EXPECT_EQ(lamp.err.substr(0, 55), "vantrel: no illuminant \"D51\"; there are A_2DEG, A_10DEG");
    const Outcome paper = vantrel("report --paper Card " + example);
    EXPECT_EQ(paper.status, 2);
    EXPECT_EQ(paper.err, "vantrel: " + example +
                             " holds no patch \"Card\"; its patches are \"Paper\", \"Magenta 10\", "
                             "\"Magenta 20\", \"Magenta 30\", \"Magenta 40\", \"Magenta 50\", "
                             "\"Magenta 60\", \"Magenta 70\", …\n");
    for (const char *words : {"", "report", "paint x", "report --format xml x", "report x y"}) {
        const Outcome done = vantrel(words);
        EXPECT_EQ(done.status, 2) << words;
        EXPECT_EQ(done.out, "") << words;
        EXPECT_EQ(std::count(done.err.begin(), done.err.end(), '\n'), 1) << done.err;
    }
    const Outcome help = vantrel("report --help");
    EXPECT_EQ(help.status, 0);
    EXPECT_NE(help.out.find("Example:\n  vantrel report "), std::string::npos);
}

TEST(Program, SaysWhenItsOutputIsLost)
{
    const Outcome full = shell(program + " report " + example + " >/dev/full");
    EXPECT_EQ(full.status, 3);
    EXPECT_EQ(full.err, "vantrel: standard output: No space left on device\n");
    const Outcome closed =
        shell("{ sleep 0.2; " + program + " report " + example + "; echo $? >&2; } | exec true");
    EXPECT_EQ(closed.err, "vantrel: standard output: Broken pipe\n3\n");
    EXPECT_EQ(vantrel("report /nowhere 2>&-").status, 2);
}
