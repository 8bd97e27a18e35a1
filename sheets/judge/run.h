// What `vantrel run` says about the sheets of a press run.
#pragma once

#include "judge/advice.h"
#include "judge/readings.h"
#include "judge/trend.h"
#include "read/measurement.h"

#include <cstddef>
#include <map>
#include <optional>
#include <string>
#include <vector>

namespace vantrel::sheets {

struct RunRequest {
    std::optional<ILLUM_OBS> illuminant; // as the files state where it is empty, or else D50
    int status = E_STATUS;
    std::string paper;              // of every sheet, as paper_of() takes it
    std::vector<std::string> order; // of printing
    Tolerances tolerances;          // none where it has no limits
};

// Where a limit was held worst and where it failed first. Sheets are counted from 0.
struct LimitPlaces {
    std::size_t worst = 0;
    std::optional<std::size_t> first_failed{};
    bool is_told = false; // by a reading that left it
};

struct RunSheet {
    std::string file;
    std::string created; // as the file says; empty where it does not
    Coverage coverage{};
    std::optional<Verdict> verdict{}; // of compare()
    std::vector<int> zones{};
};

// A reading over the zones of a sheet.
struct OverZones {
    double value; // of their mean
    double low, high;
    std::optional<double> deviation; // standard deviation, of two zones or more
    std::map<int, double> zones;
};

// A reading over the sheets of the run.
struct RunSeries {
    Measurand measurand;
    std::optional<double> aim{};
    std::optional<Limits> limits{};
    std::vector<std::optional<OverZones>> sheets;
    Trend trend{};
    std::optional<std::size_t> first_outside{}, leaves_at{};
    std::vector<std::size_t> outliers{};
    std::map<int, double> odd_zones{}; // zones unlike the others, and by how much
    struct ZoneOutlier {
        std::size_t sheet;
        int zone;
        double difference; // from the same zone on the other sheets
    };
    std::vector<ZoneOutlier> zone_outliers{};
};

struct Run {
    std::string aims; // file
    IlluminantChoice illuminant;
    int status;
    std::string job{}, instrument{}, condition{}; // of all sheets, each once
    bool by_date = false;                         // the order of the sheets
    std::vector<RunSheet> sheets;
    std::vector<std::string> unread; // sheets, with the reason
    std::string tolerances;          // their name
    std::vector<LimitResult> limits; // each as the sheet that was farthest from holding it
    std::vector<LimitPlaces> limit_places;
    std::vector<RunSeries> series;
    std::vector<SolidAdvice> advice; // for the last sheet
    std::vector<std::string> gaps;   // what single sheets lack
    std::vector<std::string> warnings;
    // Failed where a sheet failed; or else incomplete where one could not be read or judged whole,
    // or lacks what others have. Without limits nothing, or incomplete.
    std::optional<Verdict> verdict;
};

// Takes the sheets one by one and keeps their readings alone.
class RunJudge {
public:
    RunJudge(Measurement aims, RunRequest request);

    void add(const Measurement &sheet);
    void add_unread(const std::string &reason); // with the file

    // Throws RequestError where no sheet could be judged.
    Run result();

private:
    struct Entry {
        RunSheet sheet;
        SheetReadings readings;
        Origin origin;
        std::string condition;
    };

    void sort_by_date(Run &run);
    void add_series(Run &run) const;
    void find_gaps(Run &run) const;
    void add_limits(Run &run) const;
    void judge(RunSeries &series) const;
    void add_advice(Run &run) const;
    void warn_of_few(Run &run) const;
    void compare_origins(Run &run) const;
    void add_warnings(Run &run) const;

    Measurement aims;
    RunRequest request;
    std::optional<IlluminantChoice> illuminant; // by the aims and the first sheet
    std::vector<Entry> entries;
    std::vector<std::string> unread;
    std::vector<std::string> unserved; // aims of which no sheet has a patch
};

} // namespace vantrel::sheets
