// What a measurement file holds, whatever its format.
#pragma once

#include "read/tell.h"

#include <vantrel.h>

#include <array>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace vantrel::sheets {

using Spectrum = std::array<double, VANTREL_BANDS>; // 400, 410, … 700 nm in percent

struct Patch {
    std::string id;
    std::string name;
    Spectrum refl{}; // without meaning where the sheet is of Kind::colours
    // CMYK_M, … in percent, by field name; empty where the file has none for this patch. Inks that
    // other patches name and this one does not are at 0.
    std::vector<std::pair<std::string, double>> device;
    std::optional<CIELABCOORD> lab; // what the file itself says, under Measurement::colours
    std::size_t line = 0;           // where it stands in the file
};

// What the spectra looked like in the file.
struct Source {
    double first_nm = 0;
    double last_nm = 0;
    double step_nm = 0;
    std::size_t bands = 0;
    bool averaged = false;     // finer steps, brought to 10 nm as Bands::of() does
    bool interpolated = false; // from steps of 20 nm
    bool held = false;         // the last value of the range stands for bands outside it
    bool scaled = false;       // not in percent there
    std::string scale_by; // what told the scale: a keyword, the kind of file, "values" or "--scale"
    std::string condition; // M0 to M3 (ISO 13655), empty where the file does not say
    std::string setup;     // backing and geometry, in the words of the file
};

// What colours were computed for, by the file.
struct Colours {
    std::optional<ILLUM_OBS> illuminant; // where it is one of the library's
    std::string stated;                  // by the file, in its words; empty where it does not say
};

// Who measured what and when, in the words of the file; empty where it does not say.
struct Origin {
    std::string originator;
    std::string descriptor;
    std::string created; // date and time
    std::string instrument;
    std::string job;
};

enum class Kind {
    reflectance,
    transmission, // of film, say: there is no paper
    colours,      // L*a*b* alone, no spectra
};

// How a file is to be read.
enum class Scale { automatic, percent, fraction };
struct Reading {
    Scale scale = Scale::automatic;
    std::string condition; // M0 to M3; empty for the one that the file has, or M1 of several
    bool colours = false;  // L*a*b* alone will do; otherwise a file without spectra is refused
    Tell tell{};
};

struct Measurement {
    std::string file;           // its name, safe to print
    std::vector<Patch> patches; // at least one
    bool named = false;         // the file has names or ids; without any, places stand for them
    bool has_ids = false;       // of its own; otherwise places stand for them
    Kind kind = Kind::reflectance;
    bool collection = false; // of colours, a spot library, say: no paper among them
    Source source;
    Colours colours;
    Origin origin;
    std::vector<std::string> warnings; // one line each, without the file name
};

// A file that cannot be read: the reason, and the line where one can be named (otherwise 0).
struct InputError {
    std::size_t line;
    std::string reason;
};

// "sheet.txt:12: …"
std::string complaint_of(const std::string &file, const InputError &error);

// A request that cannot be met: the message.
struct RequestError {
    std::string message;
};

// Whether a device field is an ink: RGB is what a display or an image says.
bool is_ink(std::string_view field);

// The warnings with the file's name.
std::vector<std::string> reading_warnings(const Measurement &sheet);

// The first patch of this name, or else of this id; null where there is none.
const Patch *find_patch(const Measurement &sheet, std::string_view name);

// find_patch(); throws RequestError.
const Patch &patch_named(const Measurement &sheet, std::string_view name);

// The places of all patches of this name, or else of this id; throws RequestError where there is
// none.
std::vector<std::size_t> places_named(const Measurement &sheet, std::string_view name);

} // namespace vantrel::sheets
