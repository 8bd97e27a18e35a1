/* A host in C: vantrel_host COMMAND OPTIONS FILE… prints the answer of vantrel_COMMAND(), or the
 * reason why there is none, with exit status 2. `vantrel_host spectra` opens its file's spectra and
 * names from memory first, and reports on them; `vantrel_host nulls` prints what calls with a null
 * pointer say. */
#include <stdio.h>
#include <stdlib.h>
#include <string.h>
#include <vantrel_sheets.h>

enum { most = 4 };

static void end_unless_ok(VantrelAnswer *answer)
{
    if (vantrel_answer_ok(answer))
        return;
    fprintf(stderr, "%s\n", vantrel_answer_text(answer));
    exit(2);
}

static VantrelSheet *open_file(const char *path)
{
    VantrelSheet *sheet = NULL;
    FILE *file = fopen(path, "rb");
    char *bytes = malloc(1 << 22);
    size_t size = file ? fread(bytes, 1, 1 << 22, file) : 0;
    VantrelAnswer *answer = vantrel_open(path, bytes, size, NULL, &sheet, NULL, NULL);
    end_unless_ok(answer);
    vantrel_answer_free(answer);
    free(bytes);
    fclose(file);
    return sheet;
}

static VantrelSheet *from_memory(VantrelSheet *sheet, const char *name)
{
    size_t patches = vantrel_patches(sheet), i;
    double *spectra = malloc(patches * 31 * sizeof *spectra);
    const char **names = malloc(patches * sizeof *names);
    VantrelSheet *made = NULL;
    VantrelAnswer *answer;
    if (!vantrel_spectra(sheet, spectra) || vantrel_patch_name(sheet, patches) ||
        vantrel_patch_id(sheet, patches))
        exit(3);
    for (i = 0; i < patches; ++i)
        names[i] = vantrel_patch_name(sheet, i);
    answer =
        vantrel_open_spectra(name, spectra, patches, 31, names, "{\"scale\": \"percent\"}", &made);
    end_unless_ok(answer);
    puts(vantrel_answer_text(answer));
    vantrel_answer_free(answer);
    vantrel_close(sheet);
    free(spectra);
    free(names);
    return made;
}

static int say_nulls(const VantrelSheet *sheet)
{
    const char *names[] = {NULL};
    const VantrelSheet *none = NULL;
    VantrelSheet *made = NULL;
    double row[31] = {0};
    VantrelAnswer *answers[] = {
        vantrel_open(NULL, "", 0, NULL, &made, NULL, NULL),
        vantrel_open("x", NULL, 1, NULL, &made, NULL, NULL),
        vantrel_open("x", "", 0, NULL, NULL, NULL, NULL),
        vantrel_open_spectra("x", NULL, 1, 31, NULL, NULL, &made),
        vantrel_open_spectra("x", row, 1, 31, names, NULL, &made),
        vantrel_open_spectra("x", row, (size_t)-1, 31, NULL, NULL, &made),
        vantrel_report(NULL, 0, NULL, NULL, NULL, NULL),
        vantrel_report(NULL, 1, NULL, NULL, NULL, NULL),
        vantrel_report(&none, 1, NULL, NULL, NULL, NULL),
        vantrel_compare(none, sheet, NULL, NULL, NULL),
        vantrel_compare(sheet, none, NULL, NULL, NULL),
        vantrel_run(&sheet, 1, none, NULL),
        vantrel_predict(none, NULL),
        vantrel_ink(none, NULL),
    };
    size_t i;
    for (i = 0; i < sizeof answers / sizeof *answers; ++i) {
        printf("%d %s\n", vantrel_answer_ok(answers[i]), vantrel_answer_text(answers[i]));
        vantrel_answer_free(answers[i]);
    }
    return vantrel_patches(none) || vantrel_spectra(none, row) || vantrel_patch_name(none, 0);
}

int main(int count, char **words)
{
    const char *command = words[1], *options = words[2];
    VantrelSheet *sheets[most] = {NULL};
    const VantrelSheet *const *given = (const VantrelSheet *const *)sheets;
    VantrelAnswer *answer;
    int i, files = count - 3;
    for (i = 0; i < files && i < most; ++i)
        sheets[i] = open_file(words[3 + i]);
    if (!strcmp(command, "nulls")) {
        i = say_nulls(sheets[0]);
        vantrel_close(sheets[0]);
        return i;
    }
    if (!strcmp(command, "spectra"))
        sheets[0] = from_memory(sheets[0], words[3]);
    answer =
        !strcmp(command, "compare")   ? vantrel_compare(sheets[0], sheets[1], options, NULL, NULL)
        : !strcmp(command, "predict") ? vantrel_predict(sheets[0], options)
        : !strcmp(command, "run") ? vantrel_run(given + 1, (size_t)files - 1, sheets[0], options)
        : !strcmp(command, "ink") ? vantrel_ink(sheets[0], options)
                                  : vantrel_report(given, (size_t)files, NULL, options, NULL, NULL);
    end_unless_ok(answer);
    if (fwrite(vantrel_answer_text(answer), 1, vantrel_answer_size(answer), stdout) == 0)
        return 3;
    vantrel_answer_free(answer);
    for (i = 0; i < files && i < most; ++i)
        vantrel_close(sheets[i]);
    return 0;
}
