/* Measurement files for hosts in any language: reading, reports, comparisons, predictions.
 *
 *     VantrelSheet *sheet = NULL;
 *     VantrelAnswer *answer = vantrel_open("sheet.txt", bytes, size, "{}", &sheet, NULL, NULL);
 *     if (vantrel_answer_ok(answer)) {
 *         vantrel_answer_free(answer);
 *         answer = vantrel_report((const VantrelSheet *const *)&sheet, 1, NULL,
 *                                 "{\"status\": \"T_STATUS\"}", NULL, NULL);
 *     }
 *     puts(vantrel_answer_text(answer));
 *     vantrel_answer_free(answer);
 *     vantrel_close(sheet);
 *
 * Every call answers with JSON, byte for byte what the program vantrel prints (docs/json.md), or
 * with the reason why there is none. Texts are UTF-8. Options are a JSON object; null is none, and
 * an unknown one, or a value that it does not take, is refused. There is no global state: threads
 * may use one sheet at the same time as long as none closes it. No exception leaves a call; where
 * memory runs out, that is the answer. A null pointer is legal only where it says so: any other is
 * refused, and a sheet that is null has no patches. An answer is never null. */
#ifndef VANTREL_SHEETS_H
#define VANTREL_SHEETS_H

#include <stddef.h>

#if defined(_WIN32) && defined(VANTREL_SHEETS_BUILD)
#define VANTREL_SHEETS_API __declspec(dllexport)
#elif defined(_WIN32) && !defined(VANTREL_SHEETS_STATIC)
#define VANTREL_SHEETS_API __declspec(dllimport)
#elif defined(__GNUC__)
#define VANTREL_SHEETS_API __attribute__((visibility("default")))
#else
#define VANTREL_SHEETS_API
#endif

#ifdef __cplusplus
extern "C" {
#endif

typedef struct VantrelSheet VantrelSheet;   /* a measurement */
typedef struct VantrelAnswer VantrelAnswer; /* what a call has to say */

/* Told what is being done and which share of it is done, 1 at its end; may be null. It must not
 * throw. */
typedef void (*VantrelTell)(void *user, const char *what, double share);

/* Reads CGATS text, CSV or CxF. `name` stands for the file in what is said about it. The answer has
 * `file`, `patches` (their number) and `warnings`; `*sheet` is null where the file is refused.
 * Options: `scale` (auto, percent, fraction) and `condition` (M0 to M3). */
VANTREL_SHEETS_API VantrelAnswer *vantrel_open(const char *name, const char *bytes, size_t size,
                                               const char *options, VantrelSheet **sheet,
                                               VantrelTell tell, void *user);

/* The same of spectra in memory, a row of `bands` doubles for each of `patches`. `names` has a text
 * for each patch, or is null, and places stand for them. Further options: `wavelengths` (a list of
 * `bands` numbers in nm, by default 400, 410, … 700) and `device` (by field, CMYK_C say, a list of
 * a percentage or null for each patch). */
VANTREL_SHEETS_API VantrelAnswer *vantrel_open_spectra(const char *name, const double *spectra,
                                                       size_t patches, size_t bands,
                                                       const char *const *names,
                                                       const char *options, VantrelSheet **sheet);

VANTREL_SHEETS_API void vantrel_close(VantrelSheet *sheet); /* null is fine */

/* What was read. vantrel_spectra() writes a row of 31 doubles for each patch, in percent at 400,
 * 410, … 700 nm, and returns 1; or 0, and writes nothing, where the file holds colours alone. A
 * name or an id lives as long as the sheet, and is null beyond the last patch. */
VANTREL_SHEETS_API size_t vantrel_patches(const VantrelSheet *sheet);
VANTREL_SHEETS_API int vantrel_spectra(const VantrelSheet *sheet, double *spectra);
VANTREL_SHEETS_API const char *vantrel_patch_name(const VantrelSheet *sheet, size_t patch);
VANTREL_SHEETS_API const char *vantrel_patch_id(const VantrelSheet *sheet, size_t patch);

/* What the commands of the program say. The second sheet of a report, null for none, holds the
 * second paper. Options have the names of the program's, with underscores, and its defaults:
 *
 * - all: illuminant, status, paper, format (json, html, csv, cgats, table; page: the JSON that html
 *   holds, of very many patches a choice)
 * - report: n_factor, order (a list), second_paper, second_illuminant
 * - compare: pair (auto, name, id, device, order), force_pairs, repeats (mean, each),
 *   allow_missing, formula (a list), weights ({"cmc": [2, 1]}), second_illuminant, words (ab, hue),
 *   tolerance, tolerances (TOML text), tolerances_name (where it has none), substrate_corrected,
 *   advice
 * - run: order (a list), tolerances, tolerances_name, unread (a list of reasons: sheets that the
 *   host could not open)
 * - predict: order (a list), ink ([["Magenta 100", 40], ["Cyan 100", 7]])
 * - ink: patch, against, order (a list) */
VANTREL_SHEETS_API VantrelAnswer *vantrel_report(const VantrelSheet *const *sheets, size_t count,
                                                 const VantrelSheet *second_sheet,
                                                 const char *options, VantrelTell tell, void *user);
VANTREL_SHEETS_API VantrelAnswer *vantrel_compare(const VantrelSheet *reference,
                                                  const VantrelSheet *sample, const char *options,
                                                  VantrelTell tell, void *user);
VANTREL_SHEETS_API VantrelAnswer *vantrel_run(const VantrelSheet *const *sheets, size_t count,
                                              const VantrelSheet *aims, const char *options);
VANTREL_SHEETS_API VantrelAnswer *vantrel_predict(const VantrelSheet *sheet, const char *options);
VANTREL_SHEETS_API VantrelAnswer *vantrel_ink(const VantrelSheet *sheet, const char *options);

VANTREL_SHEETS_API int vantrel_answer_ok(const VantrelAnswer *answer); /* 0: the text is a reason */
VANTREL_SHEETS_API const char *vantrel_answer_text(const VantrelAnswer *answer); /* ends with 0 */
VANTREL_SHEETS_API size_t vantrel_answer_size(const VantrelAnswer *answer);      /* without it */
VANTREL_SHEETS_API void vantrel_answer_free(VantrelAnswer *answer);              /* null is fine */

#ifdef __cplusplus
}
#endif

#endif
