// vantrel run SHEET… --aims AIMS

#include "judge/run.h"
#include "options.h"
#include "system.h"

#include <memory>

namespace vantrel::program {
namespace {

struct RunOptions : Options {
    std::vector<std::string> files;
    std::string aims;
    std::vector<std::string> order; // of printing
    std::string tolerances;         // a file
};

Outcome run(const RunOptions &options)
{
    RunJudge judge(sheet_of(options.aims, options, true),
                   {.illuminant = optional_illuminant(options.illuminant),
                    .status = status_of(options.status),
                    .paper = options.paper,
                    .order = options.order,
                    .tolerances = tolerances_of(options.tolerances)});
    for (const std::string &file : files_of(options.files)) {
        try {
            judge.add(sheet_of(file, options));
        } catch (const RequestError &error) {
            judge.add_unread(error.message);
        }
    }
    Run run = judge.result();
    const Verdict verdict = run.verdict.value_or(Verdict::passed);
    std::vector<std::string> warnings = run.warnings;
    for (const std::string &reason : run.unread)
        warnings.push_back("not judged: " + reason);
    Outcome outcome = outcome_of(std::move(run), std::move(warnings), options);
    outcome.within_tolerance = verdict == Verdict::passed;
    return outcome;
}

constexpr const char *kRunFooter =
    "Sheets stand in the order of their date where all have one, or else as they are named. An aim "
    "serves\nall patches of its inks on a sheet, its zones: their number ends the name, as in "
    "\"M100 Z5\", or is that\nof their place. A reading is that of the mean of the zones; Zones± "
    "is the standard deviation over the\nzones of the last sheet. Mean, SD and slope are over the "
    "sheets; ± is half of the 95 % interval of the\nslope (Student's t). A slope that is larger "
    "and "
    "leaves a limit within ten more sheets is told. A reading\nstands apart where its modified "
    "z-score is above 8 (Iglewicz and Hoaglin 1993), about the median slope\n(Theil 1950, Sen "
    "1968); the slope is without it.\n\n"
    "--tolerances judges each sheet as compare does, on the mean of its zones. A sheet that cannot "
    "be read,\none whose patches or aims find no partner, and one that lacks a zone or a reading "
    "that others have make\nthe verdict incomplete, with limits or without. Exit status 1: failed "
    "or incomplete.\n\n"
    "Example:\n  vantrel run run_*.txt --aims aims.txt --tolerances run.toml";

} // namespace

Command add_run(CLI::App &app)
{
    const auto options = std::make_shared<RunOptions>();
    CLI::App *command = app.add_subcommand(
        "run", "A press run: what is out of its limits, what drifts, what to change");
    command->add_option("SHEET", options->files, "Measurement files with spectra")->required();
    command
        ->add_option("--aims", options->aims,
                     "Measurement file of the aims: spectra, or L*a*b* alone")
        ->required();
    command->add_option("--tolerances", options->tolerances,
                        "TOML file of limits by group of patches; examples/ has three");
    add_sheet_options(*command, *options);
    add_order_option(*command, options->order);
    command->footer(kRunFooter);
    return {command, [options] { return run(*options); }};
}

} // namespace vantrel::program
