// Reading: one small text for each habit of the programs that write measurement files.

#include "read/reader.h"
#include "read/text.h"

#include <fstream>
#include <iterator>

#include <fmt/format.h>
#include <gtest/gtest.h>

using namespace vantrel::sheets;

namespace {

// A straight line over the wavelengths, in percent, for each patch; averages leave it straight.
double line(double nm, std::size_t patch) { return nm / 10 + 10 * static_cast<double>(patch); }

std::string fields(const std::string &form, const std::string &separator, double first = 400,
                   double last = 700, double step = 10)
{
    std::string out;
    for (int i = 0; first + i * step < last + 0.01; ++i)
        out += fmt::format(fmt::runtime(i ? separator + form : form), first + i * step);
    return out;
}

std::string values(std::size_t patch, const std::string &separator, double scale = 1,
                   double first = 400, double last = 700, double step = 10)
{
    std::string out;
    for (int i = 0; first + i * step < last + 0.01; ++i)
        out += fmt::format("{}{:g}", i ? separator : "", line(first + i * step, patch) * scale);
    return out;
}

std::string replaced(const std::string &text, const std::string &from, const std::string &to)
{
    std::string out;
    std::size_t at = 0;
    for (std::size_t next; (next = text.find(from, at)) != std::string::npos;
         at = next + from.size())
        out += text.substr(at, next - at) + to;
    return out + text.substr(at);
}

std::string file(const std::string &name)
{
    std::ifstream in(VANTREL_DATA "/" + name, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
}

const std::string named = "SAMPLE_ID\tSAMPLE_NAME\t" + fields("SPECTRAL_NM{:g}", "\t");
const std::string rows =
    "A1\tFirst one\t" + values(0, "\t") + "\nA2\t\"2\tnd\"\t" + values(1, "\t");

std::string cgats(const std::string &fields, const std::string &rows, const std::string &head = "")
{
    return head + "BEGIN_DATA_FORMAT\n" + fields + "\nEND_DATA_FORMAT\nBEGIN_DATA\n" + rows +
           "\nEND_DATA\n";
}

std::string cxf(const std::string &values, const std::string &range = "Increment=\"10\"",
                const std::string &more = "")
{
    return "<CxF><Resources><ObjectCollection>\n<Object Name=\"P\" Id=\"p\"><ColorValues>\n"
           "<ReflectanceSpectrum StartWL=\"400\" ColorSpecification=\"C\">" +
           values + "</ReflectanceSpectrum>" + more +
           "</ColorValues></Object>\n</ObjectCollection><ColorSpecificationCollection>"
           "<ColorSpecification Id=\"C\"><MeasurementSpec><WavelengthRange " +
           range +
           "/></MeasurementSpec></ColorSpecification></ColorSpecificationCollection>"
           "</Resources></CxF>";
}

void expect_line(const Measurement &sheet, const std::string &what)
{
    for (std::size_t i = 0; i < sheet.patches.size(); ++i)
        for (int band = 0; band < VANTREL_BANDS; ++band)
            ASSERT_NEAR(sheet.patches[i].refl[band], line(400 + 10 * band, i), 1e-9)
                << what << ", patch " << i << ", band " << band;
}

std::string names_in(const Measurement &sheet)
{
    std::string out;
    for (const Patch &patch : sheet.patches)
        out += (out.empty() ? "" : "|") + patch.name;
    return out;
}

std::string devices_in(const Patch &patch)
{
    std::string out;
    for (const auto &[field, value] : patch.device)
        out += fmt::format("{}{} {:g}", out.empty() ? "" : ", ", field, value);
    return out;
}

std::string complaint_of(const std::string &text, const Reading &reading = {})
{
    try {
        return fmt::format("read {}", read_measurement(text, reading).patches.size());
    } catch (const InputError &error) {
        EXPECT_EQ(printable(error.reason), error.reason);
        return fmt::format("{}: {}", error.line, error.reason);
    }
}

} // namespace

TEST(Reader, KnowsEveryNameOfASpectralColumn)
{
    for (const char *form :
         {"SPECTRAL_NM{:g}", "SPECTRAL_NM_{:g}", "SPECTRAL_{:g}", "SPEC_{:g}", "NM{:g}", "nm{:g}",
          "NM_{:g}", "SPECTRUM_{:g}", "R_{:g}", "R{:g}", "{:g}NM", "{:g} nm", "{:g}",
          "Spectral_nm{:g}", "Refl {:g} nm [%]", "Reflectance_{:g}", "{:g}nm (%)"}) {
        const std::string names = fields(form, "\t"), down = fields(form, "\t", 700, 400, 10);
        expect_line(read_measurement(cgats(names, values(0, "\t")), {}), form);
        expect_line(read_measurement(replaced(names, "\t", ",") + "\n" + values(0, ","), {}), form);
    }
    std::string backwards, back;
    for (int nm = 700; nm >= 400; nm -= 10) {
        backwards += fmt::format("nm_{} LAB_L ", nm);
        back += fmt::format("{} - ", line(nm, 0));
    }
    expect_line(read_measurement(cgats(backwards, back), {}), "backwards");
}

TEST(Reader, ReadsTheDialectsOfCgats)
{
    const std::string plain = cgats(named, rows), spaces = replaced(named, "\t", " ");
    std::string wide = "\xFF\xFE"; // UTF-16
    for (const char c : plain)
        wide += {c, '\0'};
    const struct {
        const char *what;
        std::string text;
        std::string names = "First one|2 nd";
        std::string warning{};
    } dialects[] = {
        {"plain", plain},
        {"CRLF", replaced(plain, "\n", "\r\n")},
        {"CR", replaced(plain, "\n", "\r")},
        {"byte-order mark", "\xEF\xBB\xBF" + plain},
        {"UTF-16", wide},
        {"identification",
         "My Program 2.1 (demo)\nKEY one\nKEY two\nKEY\n.INCLUDE \"x\"\n" + plain},
        {"comments",
         "# BEGIN_DATA\n" + replaced(plain, "BEGIN_DATA\n", "BEGIN_DATA\n\n # 1 2 3\n")},
        {"decimal commas", replaced(cgats(named, rows), ".", ",")},
        {"padded, with a tab at the end", replaced(plain, "\n", " \t \n")},
        {"lower case", replaced(plain, "SAMPLE_NAME", "sampleName")},
        {"spaces", cgats(spaces, "1 \"First one\" " + values(0, "  ")), "First one"},
        {"names over lines", replaced(plain, "\tSPECTRAL_NM500", "\nSPECTRAL_NM500")},
        {"no names", cgats(fields("NM{:g}", " "), values(0, " ")), "1"},
        {"Latin-1", replaced(plain, "First one", "wei\xDF"), "weiß|2 nd"},
        {"escape", replaced(plain, "First one", "\x1b[2J\"q\""), "\uFFFD[2J\"q\"|2 nd"},
        {"empty column", cgats("LAB_L\t\t" + named, "-\t\t" + replaced(rows, "\nA2", "\n-\t\tA2"))},
        {"counts", "NUMBER_OF_SETS 7\nNUMBER_OF_FIELDS \"33\"\n" + plain, "First one|2 nd",
         "1: NUMBER_OF_SETS is 7, but 2 follow"},
        {"inks of another scale",
         cgats("CMYK_K\t" + named, "0\t" + replaced(rows, "\nA2", "\n255\tA2")), "First one|2 nd",
         " the largest ink value is 255; they are taken for percentages"},
        {"a table before", cgats("SAMPLE_ID LAB_L", "1 50") + plain},
        {"joined tables", cgats(named, rows.substr(0, rows.find('\n'))) +
                              cgats(named, rows.substr(rows.find('\n') + 1))},
        {"another table after", plain + cgats("X\t" + named, "x\t" + rows), "First one|2 nd",
         "11: spectra in other fields than those before are left out"},
    };
    for (const auto &[what, text, names, warning] : dialects) {
        const Measurement sheet = read_measurement(text, {});
        EXPECT_EQ(names_in(sheet), names) << what;
        EXPECT_EQ(sheet.warnings.empty() ? "" : sheet.warnings.back(), warning) << what;
        EXPECT_LE(sheet.warnings.size(), 1u) << what;
        expect_line(sheet, what);
    }
}

TEST(Reader, ReadsCsvWithItsTintsAndInks)
{
    const std::string head = fields("R{:g}", ","), first = values(0, ","), second = values(1, ",");
    const struct {
        const char *what;
        std::string text;
        std::string names;
        std::string devices; // of the last patch
    } sheets[] = {
        {"quotes",
         "sep=,\n\"\nPatch," + head + "\n\"a, \"\"b\"\"\nc\"," + first + ",,\n,,,\nd," + second,
         "a, \"b\" c|d", ""},
        {"inks",
         "patch,magenta_pct,Yellow %,L," + head + "\nx,0,0,9," + first + "\ny,40,,9," + second,
         "x|y", "CMYK_M 40, CMYK_Y 0"},
        {"fractions", "No,Ink,tint," + head + "\n7,paper,0," + first + "\n8,Reflex,0.07," + second,
         "paper|Reflex 7", "Reflex 7"},
        {"all initials", "C,M,Y,K," + head + "\n,,,," + first + "\n1,2,3,100," + second, "1|2",
         "CMYK_C 1, CMYK_M 2, CMYK_Y 3, CMYK_K 100"},
        {"chroma", "L,a,b,C,h," + head + "\n1,2,3,4,5," + first, "1", ""},
        {"words", "Lab_L,Farbe," + head + "\n50,rot," + first + "\n60,," + second, "rot|2", ""},
        {"tabs", replaced("Name," + head + "\na b," + first, ",", "\t"), "a b", ""},
    };
    for (const auto &[what, text, names, devices] : sheets) {
        const Measurement sheet = read_measurement(text, {});
        EXPECT_EQ(names_in(sheet), names) << what;
        EXPECT_EQ(devices_in(sheet.patches.back()), devices) << what;
        expect_line(sheet, what);
    }
    const Measurement sheet = read_measurement(file("tints_semicolons.csv"), {});
    EXPECT_EQ(names_in(sheet), "Papier|Magenta 50|Magenta 100|Ton; \"hell\" zweizeilig");
    EXPECT_EQ(devices_in(sheet.patches[0]), "Magenta 0");
    EXPECT_EQ(devices_in(sheet.patches[3]), "Gelb 100");
    EXPECT_NEAR(sheet.patches[1].refl[0], 58.772, 1e-9);
    EXPECT_TRUE(sheet.source.scaled);
}

TEST(Reader, ReadsCxfByCondition)
{
    const std::string text = file("conditions.cxf");
    for (const char *prefix : {"cc:", "cxf:", ""}) {
        const Measurement sheet = read_measurement(replaced(text, "cc:", prefix), {});
        EXPECT_EQ(names_in(sheet), "Papier weiß|Magenta|Yellow|Spot 50|Spot 50 on black");
        EXPECT_EQ(sheet.source.condition, "M1");
        ASSERT_EQ(sheet.warnings.size(), 2u);
        EXPECT_EQ(sheet.warnings[1],
                  " spectra under M0, M1: those under M1 are read, --condition chooses");
        EXPECT_EQ(devices_in(sheet.patches[2]),
                  "CMYK_C 0, CMYK_M 0, CMYK_Y 100, CMYK_K 0, Warm & red 12.5");
        EXPECT_EQ(devices_in(sheet.patches[3]), "Reflex <violet> 50");
        EXPECT_EQ(devices_in(sheet.patches[4]), "");
        EXPECT_NEAR(sheet.patches[0].refl[0], 84.22, 1e-9);
        EXPECT_EQ(sheet.patches[1].id, "o2");
    }
    const Measurement older = read_measurement(text, {Scale::automatic, "m0"});
    EXPECT_EQ(older.patches.size(), 6u);
    EXPECT_NEAR(older.patches[0].refl[0], 84.22 * 0.9, 1e-9);
    const Reading third{Scale::automatic, "M3"};
    EXPECT_EQ(complaint_of(text, third), "0: no spectra under M3; the file has M0, M1");
    EXPECT_EQ(complaint_of(replaced(text, ">false<", ">true<"), third), "read 6");
    EXPECT_EQ(complaint_of(replaced(replaced(text, "M0_Incandescent", ""), "CS0", "of M2"),
                           {Scale::automatic, "M2"}),
              "read 6");

    // CGATS and CSV name the condition in a keyword or a column.
    const std::string tables = cgats(named, rows, "MEASUREMENT_CONDITION \"M0\"\n") +
                               cgats(named, rows, "ILLUMINATION_NAME M2\n");
    EXPECT_EQ(read_measurement(tables, {}).source.condition, "M0");
    EXPECT_EQ(read_measurement(tables, {Scale::automatic, "M2"}).patches.size(), 2u);
    const std::string csv = "Mode," + fields("{:g}", ",") + "\nM0," + values(5, ",") + "\nM1," +
                            values(0, ",") + "\nM2," + values(6, ",");
    expect_line(read_measurement(csv, {}), "a column of conditions");
}

TEST(Reader, BringsFinerStepsToTenNanometres)
{
    const struct {
        double first, last, step;
        double at_400; // of the line, with the triangle cut off where the range ends
    } ranges[] = {
        {380, 730, 10, 40},
        {380, 730, 5, 40},
        {360, 760, 1, 40},
        {380, 780, 10.0 / 3, 40},
        {400, 700, 5, (40 + 0.5 * 40.5) / 1.5},
        {400, 700, 10.0 / 3, (40 + 2 * 40 / 3.0 + 2 / 9.0 + 40 / 3.0 + 2 / 9.0) / 2},
        {400, 700, 2, (40 + 0.8 * 40.2 + 0.6 * 40.4 + 0.4 * 40.6 + 0.2 * 40.8) / 3},
    };
    for (const auto &[first, last, step, at_400] : ranges) {
        const std::string text =
            cgats(fields("NM{:.2f}", " ", first, last, step), values(0, " ", 1, first, last, step));
        const Measurement sheet = read_measurement(text, {});
        EXPECT_NEAR(sheet.patches[0].refl[0], at_400, 2e-3) << first << ' ' << step;
        EXPECT_NEAR(sheet.patches[0].refl[15], 55, 2e-3) << first << ' ' << step;
        EXPECT_EQ(sheet.source.averaged, step != 10);
        EXPECT_NEAR(sheet.source.step_nm, step, 0.02);
    }
    // a peak: half of each neighbour at 5 nm, names rounded to 1 nm
    std::string peak = values(0, " ", 0, 400, 700, 5);
    peak[40] = '4'; // 500 nm
    const auto refl =
        read_measurement(cgats(fields("nm{:.0f}", " ", 400, 700, 5), peak), {Scale::percent, ""})
            .patches[0]
            .refl;
    EXPECT_EQ(refl[9], 0);
    EXPECT_EQ(refl[10], 2);
    EXPECT_EQ(refl[11], 0);
}

TEST(Reader, FindsTheScale)
{
    const std::string field = fields("NM{:g}", " "), percent = values(0, " ");
    const std::string fraction = values(0, " ", 0.01),
                      pair = fields("SPECTRAL_NM SPECTRAL_DEC", " ");
    std::string pairs;
    for (int nm = 400; nm <= 700; nm += 10)
        pairs += fmt::format("{} {} ", nm, line(nm, 0) / 100);
    const struct {
        std::string text;
        Scale scale;
        const char *by;
        double factor = 1; // on the line
    } scales[] = {
        {cgats(field, percent), Scale::automatic, "values"},
        {cgats(field, fraction), Scale::automatic, "values"},
        {cgats(field, fraction, "SPECTRAL_NORM \"1.0\"\n"), Scale::automatic, "SPECTRAL_NORM"},
        {cgats(field, values(0, " ", 2.55), "SPECTRAL_NORM 255\n"), Scale::automatic,
         "SPECTRAL_NORM"},
        {cgats(pair, pairs), Scale::automatic, "SPECTRAL_DEC"},
        {cgats(field, fraction), Scale::percent, "--scale", 0.01},
        {cgats(replaced(pair, "DEC", "PCT"), pairs), Scale::fraction, "--scale"},
        {cxf(values(0, " ", 0.04)), Scale::automatic, "values", 4},
        {cxf(percent), Scale::automatic, "values"},
    };
    for (const auto &[text, scale, by, factor] : scales) {
        const Measurement sheet = read_measurement(text, {scale, ""});
        EXPECT_EQ(sheet.source.scale_by, by);
        EXPECT_NEAR(sheet.patches[0].refl[30], 70 * factor, 1e-9) << text.substr(0, 60) << by;
    }
    EXPECT_EQ(read_measurement(cgats(field, fraction, "SPECTRAL_NORM 100\n"), {}).warnings[0],
              " by SPECTRAL_NORM the largest reflectance is 0.7 %; --scale sets the scale");
}

TEST(Reader, RefusesWithTheReasonAndTheLine)
{
    const std::string good = cgats(named, rows),
                      csv = "Name," + fields("R{:g}", ",") + "\na," + values(0, ",");
    const std::string whole = file("conditions.cxf");
    const std::string needed = "every 10 nm from 400 to 700 is needed, or finer steps";
    const struct {
        std::string text;
        std::string complaint;
    } cases[] = {
        {" \r\n\t", "0: the file is empty"},
        {good + '\0', "0: not a text file"},
        {"\x89PNG\r\n",
         "0: no measurement file: it names no fields of CGATS text (BEGIN_DATA_FORMAT), "
         "is no XML, and has no CSV header with wavelengths"},
        {cgats("SAMPLE_ID LAB_L", "1 50"), "0: no spectra in this file"},
        {cgats(fields("{:g}", " ", 400, 700, 20), values(0, " ", 1, 400, 700, 20)),
         "2: no value between 400 and 420 nm in spectra of 16 values from 400 to 700 nm; " +
             needed},
        {cgats(fields("{:g}", " ", 405, 705), values(0, " ")),
         "2: the range is too short in spectra of 31 values from 405 to 705 nm; " + needed},
        {cgats(fields("{:g}", " ", 395, 705), values(0, " ", 1, 395, 705)),
         "2: no value at 400 nm, but at 395 and 405 nm in spectra of 32 values from 395 to 705 "
         "nm; " +
             needed},
        {cgats(fields("{:g}", " ") + " 403", values(0, " ") + " 1"),
         "2: the steps are uneven, 3 to 10 nm in spectra of 32 values from 400 to 700 nm; " +
             needed},
        {cgats("SPECTRAL_NORM 1 " + fields("{:g}", " "), "", "SPECTRAL_NORM 0\n"),
         "1: SPECTRAL_NORM is \"0\""},
        {good.substr(0, good.find("A2")), "5: the file ends before END_DATA"},
        {good.substr(0, 40), "2: the file ends before END_DATA_FORMAT"},
        {replaced(csv, "41,42", "41;42"), "2: 31 values in a row of 32 fields"},
        {csv + ",1", "2: 33 values in a row of 32 fields"},
        {csv + "\n\"a\n\n," + values(0, ","), "3: a quoted text is not closed"},
        {replaced(csv, "\na", "\n\n\n\"a\nb\"") + "\nb" +
             replaced(values(0, ","), "40,", ",x\x1b,"),
         "6: R400 is \"x\uFFFD\", not a number"},
        {whole.substr(0, whole.size() - 9),
         "102: not well-formed XML: Could not determine tag type"},
        {replaced(whole, "0.84220", "&xxe;"),
         "17: \"ReflectanceSpectrum\" holds \"&xxe;\", not a number"},
        {replaced(whole, "12.5<", "twelve<"), "42: \"SpotColor\" holds \"twelve\", not a number"},
        {replaced(whole, "Increment=\"10\"", "Increment=\"0\""),
         "16: ColorSpecification \"CS0\" gives this spectrum no StartWL and Increment of its "
         "wavelengths"},
        {"<!DOCTYPE x><html/>", "1: not CxF3: \"html\" has no Resources"},
        {cxf(""), "3: a ReflectanceSpectrum without values"},
        {cxf("1 2 3"),
         "3: the range is too short in spectra of 3 values from 400 to 420 nm; " + needed},
    };
    for (const auto &[text, complaint] : cases)
        EXPECT_EQ(complaint_of(text), complaint) << text.substr(0, 100);
    EXPECT_EQ(complaint_of(good, {Scale::automatic, "M1"}),
              "0: no spectra under M1; the file has no named condition");
}

TEST(Reader, StandsWhatIsMeantToBreakIt)
{
    const std::string digits(1000, '9'), deep(300'000, 'x');
    std::string bomb = "<!DOCTYPE CxF [<!ENTITY a \"aaaa\"><!ENTITY b \"&a;&a;&a;\">"
                       "<!ENTITY c SYSTEM \"file:///etc/passwd\">]>";
    Measurement sheet = read_measurement(
        bomb + replaced(cxf(values(0, " ", 0.01)), "Name=\"P\"", "Name=\"&b;&c;\""), {});
    EXPECT_EQ(names_in(sheet), "&b;&c;");
    EXPECT_EQ(complaint_of(cxf(values(0, " "), "Increment=\"10\"", replaced(deep, "x", "<x>")))
                  .substr(0, 24),
              "3: not well-formed XML: ");
    EXPECT_EQ(complaint_of(cxf(values(0, " "), "Increment=\"10\"",
                               replaced(deep, "x", "<x>") + replaced(deep, "x", "</x>"))),
              "read 1");
    std::string open;
    open.resize(16'000'001, '<');
    EXPECT_EQ(complaint_of(open), "0: more elements than a sheet can have");

    const std::string again = replaced(std::string(20'000, 'x'), "x", "BEGIN_DATA\nEND_DATA\n");
    std::string wide;
    for (int i = 0; i < 20'000; ++i)
        wide += fmt::format(" C{}", i);
    sheet = read_measurement(cgats(fields("{:g}", " ") + wide, values(0, " ") + wide) + again, {});
    EXPECT_EQ(sheet.patches.size(), 1u);

    const std::string columns = replaced(std::string(1'000'000, 'x'), "x", ",C"),
                      empty(1'000'000, ',');
    sheet = read_measurement(fields("{:g}", ",") + columns + "\n" + values(0, ",") + empty, {});
    expect_line(sheet, "a million columns");
    for (const std::string &text :
         {cgats(named, rows), "Name," + fields("SPECTRAL_NM{:g}", ",") + "\na," + values(0, ",")}) {
        const auto with = [&](const std::string &number) {
            return replaced(replaced(text, ",44,", "," + number + ","), "\t44\t",
                            "\t" + number + "\t");
        };
        expect_line(read_measurement(with("44." + std::string(1000, '0')), {}), "zeros");
        EXPECT_EQ(complaint_of(with(digits)).substr(3, 10), "SPECTRAL_N");
    }
    for (const std::string &text :
         {cgats(named, rows), file("tints_semicolons.csv"), file("conditions.cxf")})
        for (std::size_t size = 0; size < text.size(); size += 1 + text.size() / 500)
            EXPECT_NE(complaint_of(text.substr(0, size)), "") << size;
}
