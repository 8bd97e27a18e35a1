// Where the time of `vantrel report` and `compare` goes on a large sheet: reading, judging,
// writing.
//   vantrel_bench_sheets report|compare csv|json FILE

#include "judge/compare.h"
#include "judge/report.h"
#include "read/reader.h"
#include "write/flat.h"
#include "write/result.h"

#include <cstddef>
#include <cstdio>
#include <ctime>
#include <fstream>
#include <iostream>
#include <string>
#include <string_view>
#include <sys/resource.h>
#include <utility>
#include <vector>

namespace {

using namespace vantrel::sheets;

// Processor time, which other programs on the machine disturb least.
class Phases {
public:
    void end(const char *what)
    {
        const auto now = std::clock();
        rusage use{};
        getrusage(RUSAGE_SELF, &use);
        all.push_back({what, static_cast<double>(now - begin) / CLOCKS_PER_SEC,
                       1024 * static_cast<double>(use.ru_maxrss)});
        begin = now;
    }

    void print(const std::string &title, std::size_t patches) const
    {
        double sum = 0;
        for (const Phase &phase : all)
            sum += phase.seconds;
        std::printf("%-28s%8.2f s%8.2f us%8.0f bytes a patch  (", title.c_str(), sum,
                    1e6 * sum / static_cast<double>(patches),
                    all.back().most / static_cast<double>(patches));
        for (const Phase &phase : all)
            std::printf("%s%s %.2f s %.0f bytes", &phase == all.data() ? "" : ", ", phase.what,
                        phase.seconds, phase.most / static_cast<double>(patches));
        std::puts(")");
    }

private:
    std::clock_t begin = std::clock();
    struct Phase {
        const char *what;
        double seconds;
        double most; // bytes in memory so far
    };
    std::vector<Phase> all;
};

Measurement read(const char *path)
{
    std::ifstream file(path, std::ios::binary | std::ios::ate);
    std::string text(static_cast<std::size_t>(file.tellg()), '\0');
    file.seekg(0);
    file.read(text.data(), static_cast<std::streamsize>(text.size()));
    Measurement sheet = read_measurement(text, {});
    sheet.file = path;
    return sheet;
}

template <typename Result> void write(const Result &result, std::string_view format)
{
    const Sink sink{[](std::string_view) {}};
    if (format == "json")
        write_json(result, sink);
    else
        write_csv(flat_of(result), sink);
}

} // namespace

int main(int count, char **arguments)
{
    if (count != 4)
        return 2;
    const std::string command = arguments[1], format = arguments[2];
    try {
        Phases phases;
        Measurement sheet = read(arguments[3]);
        const std::size_t patches = sheet.patches.size();
        phases.end("reading");
        if (command == "report") {
            std::vector<Report> reports;
            reports.push_back(report_of(std::move(sheet), {}));
            phases.end("judging");
            write(reports, format);
        } else {
            const Measurement reference = read(arguments[3]);
            phases.end("reading again");
            const Comparison comparison =
                compare(reference, sheet, {.metrics = {usual_metric(Formula::de2000)}});
            phases.end("judging");
            write(comparison, format);
        }
        phases.end("writing");
        phases.print(command + " as " + format, patches);
    } catch (const InputError &error) {
        std::cerr << error.reason << '\n';
        return 2;
    } catch (const RequestError &error) {
        std::cerr << error.message << '\n';
        return 2;
    }
}
