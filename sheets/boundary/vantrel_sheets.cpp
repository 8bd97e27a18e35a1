#include "vantrel_sheets.h"

#include "boundary/calls.h"

#include <algorithm>
#include <exception>
#include <new>
#include <stdexcept>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

using namespace vantrel::sheets;

struct VantrelSheet {
    Measurement measurement;
};

struct VantrelAnswer {
    bool ok = false;
    std::string text;
};

namespace {

VantrelAnswer out_of_memory{false, "not enough memory"}; // which takes none to say

// What `work` says, or the reason why it cannot.
template <typename Work> VantrelAnswer *answer(const Work &work) noexcept
{
    try {
        try {
            return new VantrelAnswer{true, work()};
        } catch (const RequestError &error) {
            return new VantrelAnswer{false, error.message};
        } catch (const std::bad_alloc &) {
            return &out_of_memory;
        } catch (const std::length_error &) { // more than any memory holds
            return &out_of_memory;
        } catch (const std::exception &error) {
            return new VantrelAnswer{false, error.what()};
        }
    } catch (...) {
        return &out_of_memory;
    }
}

// What a host passes that has no sheet, since its file was refused, is a null pointer.
template <typename T> const T *required(const T *pointer, const char *name)
{
    if (!pointer)
        throw RequestError{std::string(name) + " is null"};
    return pointer;
}

const Measurement &measurement_of(const VantrelSheet *sheet, const char *name)
{
    return required(sheet, name)->measurement;
}

// Hands the measurement over, and says what there is to say about it.
template <typename Open> VantrelAnswer *opened(VantrelSheet **sheet, const Open &open)
{
    if (sheet)
        *sheet = nullptr;
    return answer([&] {
        required(sheet, "the place of the sheet");
        Measurement measurement = open();
        std::string out = about(measurement);
        *sheet = new VantrelSheet{std::move(measurement)};
        return out;
    });
}

std::string_view given(const char *options) { return options ? options : "{}"; }

Tell teller(VantrelTell tell, void *user)
{
    if (!tell)
        return {};
    return [=](const char *what, double share) { tell(user, what, share); };
}

std::vector<const Measurement *> measurements_of(const VantrelSheet *const *sheets,
                                                 std::size_t count)
{
    std::vector<const Measurement *> out;
    for (std::size_t i = 0; i < count; ++i)
        out.push_back(&measurement_of(required(sheets, "the list of sheets")[i], "a sheet"));
    return out;
}

const Patch *patch_at(const VantrelSheet *sheet, std::size_t patch)
{
    return patch < vantrel_patches(sheet) ? &sheet->measurement.patches[patch] : nullptr;
}

} // namespace

VantrelAnswer *vantrel_open(const char *name, const char *bytes, size_t size, const char *options,
                            VantrelSheet **sheet, VantrelTell tell, void *user)
{
    return opened(sheet, [&] {
        required(size ? bytes : "", "the file");
        return open_file(required(name, "the name"), {bytes, size}, given(options),
                         teller(tell, user));
    });
}

VantrelAnswer *vantrel_open_spectra(const char *name, const double *spectra, size_t patches,
                                    size_t bands, const char *const *names, const char *options,
                                    VantrelSheet **sheet)
{
    return opened(sheet, [&] {
        Rows rows{required(spectra, "the list of spectra"), patches, bands, {}};
        for (std::size_t i = 0; names && i < patches; ++i)
            rows.names.emplace_back(required(names[i], "a name"));
        return open_spectra(required(name, "the name"), rows, given(options));
    });
}

void vantrel_close(VantrelSheet *sheet) { delete sheet; }

size_t vantrel_patches(const VantrelSheet *sheet)
{
    return sheet ? sheet->measurement.patches.size() : 0;
}

int vantrel_spectra(const VantrelSheet *sheet, double *spectra)
{
    if (!sheet || !spectra || sheet->measurement.kind == Kind::colours)
        return 0;
    for (const Patch &patch : sheet->measurement.patches)
        spectra = std::copy(patch.refl.begin(), patch.refl.end(), spectra);
    return 1;
}

const char *vantrel_patch_name(const VantrelSheet *sheet, size_t patch)
{
    const Patch *found = patch_at(sheet, patch);
    return found ? found->name.c_str() : nullptr;
}

const char *vantrel_patch_id(const VantrelSheet *sheet, size_t patch)
{
    const Patch *found = patch_at(sheet, patch);
    return found ? found->id.c_str() : nullptr;
}

VantrelAnswer *vantrel_report(const VantrelSheet *const *sheets, size_t count,
                              const VantrelSheet *second_sheet, const char *options,
                              VantrelTell tell, void *user)
{
    return answer([&] {
        return report(measurements_of(sheets, count),
                      second_sheet ? &second_sheet->measurement : nullptr, given(options),
                      teller(tell, user));
    });
}

VantrelAnswer *vantrel_compare(const VantrelSheet *reference, const VantrelSheet *sample,
                               const char *options, VantrelTell tell, void *user)
{
    return answer([&] {
        return compare(measurement_of(reference, "the reference"),
                       measurement_of(sample, "the sample"), given(options), teller(tell, user));
    });
}

VantrelAnswer *vantrel_run(const VantrelSheet *const *sheets, size_t count,
                           const VantrelSheet *aims, const char *options)
{
    return answer([&] {
        return run(measurements_of(sheets, count), measurement_of(aims, "the sheet of aims"),
                   given(options));
    });
}

VantrelAnswer *vantrel_predict(const VantrelSheet *sheet, const char *options)
{
    return answer([&] { return predict(measurement_of(sheet, "the sheet"), given(options)); });
}

VantrelAnswer *vantrel_ink(const VantrelSheet *sheet, const char *options)
{
    return answer([&] { return ink(measurement_of(sheet, "the sheet"), given(options)); });
}

int vantrel_answer_ok(const VantrelAnswer *answer) { return answer->ok; }
const char *vantrel_answer_text(const VantrelAnswer *answer) { return answer->text.c_str(); }
size_t vantrel_answer_size(const VantrelAnswer *answer) { return answer->text.size(); }

void vantrel_answer_free(VantrelAnswer *answer)
{
    if (answer != &out_of_memory)
        delete answer;
}
