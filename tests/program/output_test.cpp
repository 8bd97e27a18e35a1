// How a result leaves the program: its formats, and the file that it is written to.

#include <filesystem>
#include <map>

#include "program.h"

namespace {

namespace fs = std::filesystem;

// CSV with a header, read without quotes within cells.
std::vector<std::map<std::string, std::string>> csv_rows(const std::string &text)
{
    std::vector<std::string> header;
    std::vector<std::map<std::string, std::string>> rows;
    std::istringstream lines(text);
    for (std::string line, cell; std::getline(lines, line);) {
        std::vector<std::string> cells;
        std::istringstream in(line + ',');
        while (std::getline(in, cell, ','))
            cells.push_back(cell);
        if (header.empty()) {
            header = cells;
            continue;
        }
        EXPECT_EQ(cells.size(), header.size()) << line;
        rows.emplace_back();
        for (std::size_t i = 0; i < std::min(cells.size(), header.size()); ++i)
            rows.back()[header[i]] = cells[i];
    }
    return rows;
}

} // namespace

TEST(Csv, HasTheRowsOfEverySheetUnderOneHeader)
{
    const std::string spot = changed("CMYK_M\tCMYK_Y", "6CLR_1\tCMYK_Y");
    const auto rows = csv_rows(vantrel("report --format csv " + example + " " + spot).out);
    ASSERT_EQ(rows.size(), 62u);
    auto tint = rows[5];
    for (const auto &[field, value] : {std::pair{"file", example.c_str()},
                                       {"name", "Magenta 50"},
                                       {"CMYK_M", "50"},
                                       {"6CLR_1", ""},
                                       {"response", "Green"},
                                       {"density", "0.2497"},
                                       {"dot_area", "68.6173"},
                                       {"dot_gain", "18.6173"},
                                       {"trap", ""},
                                       {"nm400", "58.772"}})
        EXPECT_EQ(tint[field], value) << field;
    auto other = rows[5 + 31];
    EXPECT_EQ(other["file"], spot);
    EXPECT_EQ(other["CMYK_M"], "");
    EXPECT_EQ(other["6CLR_1"], "50");
    EXPECT_EQ(other["dot_gain"], tint["dot_gain"]);
    auto solid = rows[10], overprint = rows[30];
    EXPECT_EQ(solid["hue_error"] + ' ' + solid["grayness"], "46.3384 34.3626");
    EXPECT_EQ(overprint["trap"], "68.1005");

    auto predicted = csv_rows(vantrel("predict --format csv " + example).out);
    ASSERT_EQ(predicted.size(), 20u);
    EXPECT_EQ(predicted[9]["model"], "film");
    EXPECT_EQ(predicted[9]["name"], "Magenta 100 50 % + Yellow 100 50 % film");
    EXPECT_EQ(predicted[9]["dE00_measured"], "3.7772");
    EXPECT_EQ(predicted[9]["measured"], "Magenta 50 Yellow 50");
}

// A spreadsheet must not compute what a file's text says; a number is no formula.
// As spot inks of CxF come, or tints of several inks in one column.
TEST(Csv, HasAColumnForEachInkThatAPatchNames)
{
    std::string sheet = "name,ink,tint";
    for (int nm = 400; nm <= 700; nm += 10)
        sheet += fmt::format(",{}", nm);
    for (const char *patch : {"Paper,,", "Gold 100,Gold,100", "Silver 50,Silver,50"}) {
        sheet += '\n' + std::string(patch);
        for (int band = 0; band < 31; ++band)
            sheet += fmt::format(",{}", patch[0] == 'P' ? 80 : 20 + band);
    }
    const std::string path = scratch("inks.csv");
    std::ofstream(path) << sheet;
    const auto inks_of = [](std::map<std::string, std::string> row) {
        return row["Gold"] + '|' + row["Silver"] + '|' + row["nm400"] + '|' + row["nm700"];
    };
    auto rows = csv_rows(vantrel("report --format csv " + path).out);
    ASSERT_EQ(rows.size(), 3u);
    EXPECT_EQ(inks_of(rows[0]), "||80|80");
    EXPECT_EQ(inks_of(rows[1]), "100||20|50");
    EXPECT_EQ(inks_of(rows[2]), "|50|20|50");
    rows =
        csv_rows(vantrel("ink --format csv --patch 'Gold 100' --against 'Silver 50' " + path).out);
    EXPECT_EQ(inks_of(rows[0]), "100||20|50");
    EXPECT_EQ(inks_of(rows[1]), "|50|20|50");
}

TEST(Csv, TakesTheForceFromFormulas)
{
    const struct {
        std::string name;
        std::string cell;
    } cases[] = {{"=1+1", ",'=1+1,"},
                 {"@SUM(A1)", ",'@SUM(A1),"},
                 {"-12", ",-12,"},
                 {"+4,5", ",\"+4,5\","},
                 {"-a,\"\"b", ",\"'-a,\"\"b\","}};
    for (const auto &[name, cell] : cases)
        EXPECT_NE(
            vantrel("report --format csv " + changed("Magenta 10\"", name + '"')).out.find(cell),
            std::string::npos)
            << name;
}

TEST(Cgats, IsReadBackToTheLastBit)
{
    const std::string named = changed("\"Magenta 10\"", "\"He said \"\"10\"\", # and é\"");
    const std::string written = scratch("written.txt");
    ASSERT_EQ(vantrel("report --format cgats -o " + written + " " + named).status, 0);
    Json before = json_of(named), after = json_of(written);
    for (Json *sheet : {&before, &after}) {
        sheet->erase("file");
        sheet->erase("source"); // what is written says its scale
    }
    EXPECT_EQ(before, after);

    ASSERT_EQ(vantrel("predict --format cgats -o " + written + " " + example).status, 0);
    const Json prediction = json_of(example, "predict")["predictions"][4];
    const Json film = patch(json_of(written), "Magenta 100 50 % + Yellow 100 50 % film");
    EXPECT_EQ(film["refl"], prediction["film"]["refl"]);
    EXPECT_EQ(film["lab"], prediction["film"]["lab"]);
}

TEST(OutputFile, IsReplacedWholeOrNotAtAll)
{
    const fs::path folder = scratch("folder");
    fs::remove_all(folder);
    fs::create_directory(folder);
    const std::string file = (folder / "out.txt").string();
    const std::string report = vantrel("report " + example).out;
    const std::string words = "report " + example + " -o ";

    const Outcome first = shell("umask 027; " + program + " " + words + file);
    EXPECT_EQ(first.status, 0) << first.err;
    EXPECT_EQ(first.out, "");
    EXPECT_EQ(content(file), report);
    EXPECT_EQ(fs::status(file).permissions(), fs::perms(0640));

    // What was there keeps its permissions, and a link stays one.
    fs::permissions(file, fs::perms(0604));
    std::ofstream(file) << "old";
    fs::create_symlink("out.txt", folder / "link");
    EXPECT_EQ(vantrel(words + (folder / "link").string()).status, 0);
    EXPECT_TRUE(fs::is_symlink(folder / "link"));
    EXPECT_EQ(content(file), report);
    EXPECT_EQ(fs::status(file).permissions(), fs::perms(0604));

    // A refused request, and a disk that is full, leave it alone.
    EXPECT_EQ(vantrel("report --status B " + example + " -o " + file).status, 2);
    EXPECT_EQ(content(file), report);
    const Outcome full = shell("ulimit -f 1; trap '' XFSZ; " + program + " report --format json " +
                               example + " -o " + file);
    EXPECT_EQ(full.status, 3);
    EXPECT_EQ(full.err, "vantrel: " + file + ": File too large\n");
    EXPECT_EQ(content(file), report);
    EXPECT_EQ(std::distance(fs::directory_iterator(folder), {}), 2);

    // Nor is a measurement written over.
    fs::copy_file(example, folder / "sheet.txt");
    fs::create_symlink("sheet.txt", folder / "other");
    const std::string sheet = (folder / "sheet.txt").string();
    expect_refusals("report", {{sheet + " -o " + (folder / "other").string(),
                                sheet + " is to be read; -o would write over it\n"}});
    EXPECT_EQ(content(sheet), content(example));

    for (const auto &[path, reason] : {std::pair{folder.string(), "Is a directory"},
                                       {file + "/x", "Not a directory"},
                                       {(folder / "no/x").string(), "No such file or directory"},
                                       {std::string("/dev/full"), "No space left on device"}}) {
        const Outcome done = vantrel(words + path);
        EXPECT_EQ(done.status, 3) << path;
        EXPECT_EQ(done.err, fmt::format("vantrel: {}: {}\n", path, reason));
    }
    EXPECT_EQ(vantrel(words + "/dev/stdout").out, report);
    EXPECT_EQ(vantrel(words + "-").out, report);
    EXPECT_EQ(shell("echo kept; " + program + " " + words + "/dev/stdout | cat").out,
              "kept\n" + report);
}
