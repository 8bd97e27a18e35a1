#include "read/column_names.h"

#include <algorithm>
#include <array>
#include <string>

namespace vantrel::sheets {

bool is_beside_readings(std::string_view key)
{
    constexpr std::array beginnings = {
        // colours and their differences
        "LCH", "XYZ", "XYY", "LUV", "LABC", "LABH", "LABDE", "SRGB", "RGBHEX", "HEXCODE", "HUE",
        "CHROMA", "LIGHTNESS", "HUNTER", "DE0", "DE2", "DE7", "DE9", "DEAB", "DECMC", "DECIE",
        "DE*", "DELTA", "\xCE\x94", "MEANDE", "CHISQ",
        // densities and what is computed from them
        "DENS", "DICHTE", "DOTAREA", "DOTGAIN", "TVI", "SCTV", "TRAP", "PRINTCONTRAST", "GRAY",
        "GREY", "NEUTRAL",
        // the sheet
        "WHITENESS", "BRIGHTNESS", "YELLOWNESS", "GLOSS", "GLANZ", "OPACITY", "TEMP", "HUMID",
        "FEUCHT",
        // spread
        "STDEV", "STDDEV", "STDABW", "SIGMA",
        // places and counts
        "ROW", "COLUMN", "LINE", "PAGE", "SHEET", "STRIP", "ZONE", "POS", "PLACE", "INDEX", "STEP",
        "COUNT", "SEQ", "REPEAT", "ZEILE", "SPALTE", "SEITE", "BLATT", "STREIFEN", "LIGNE",
        "COLONNE", "FEUILLE",
        // when, by whom, of what
        "DATE", "TIME", "CREATED", "DATUM", "ZEIT", "UHRZEIT", "HEURE", "OPERATOR", "USER",
        "BEDIENER", "COMMENT", "KOMMENTAR", "REMARK", "NOTE", "BEMERKUNG", "DESCRIPTION",
        "BESCHREIBUNG", "CUSTOMER", "KUNDE", "CLIENT", "JOB", "AUFTRAG", "PROJECT", "PROJEKT",
        "PRESS", "MACHINE", "MASCHINE", "BATCH", "CHARGE", "SERIAL", "SERIENN", "FILE", "DATEI",
        "FICHIER"};
    constexpr std::array wholes = {
        "C", "H", "C*", "H*", "HAB", "X", "Y", "Z", "U", "V", "U*", "V*", "DE", "DL", "DA", "DB",
        "DC", "DH", "DL*", "DA*", "DB*", "DC*", "DH*", "RGB", "HEX", "D", "DM", "DY", "DK", "DV",
        "DVIS", "DRED", "DGREEN", "DBLUE", "DMAJORFILTER", "RESPONSE", "STD", "SD", "COL", "N",
        "LOT", "INSTRUMENT", "DEVICE", "STRING", "COLOR", "COLOUR", "FARBE", "COULEUR", "COLORNAME",
        "COLOURNAME", "FARBNAME",
        // further names of the patch
        "SAMPLEID", "ID", "PATCHID", "SAMPLENO", "PATCHNO", "NUMBER", "NO", "NR", "NO.", "NR.",
        "SAMPLENAME", "NAME", "PATCHNAME", "PATCH", "SAMPLE", "LABEL", "SAMPLELOC",
        "SAMPLELOCATION", "LOCATION", "LOC", "INK", "INKNAME"};
    std::string name(key);
    std::erase_if(name, [](char c) { return c == '(' || c == ')' || c == '[' || c == ']'; });
    return std::any_of(beginnings.begin(), beginnings.end(),
                       [&](std::string_view word) { return name.starts_with(word); }) ||
           std::find(wholes.begin(), wholes.end(), name) != wholes.end();
}

} // namespace vantrel::sheets
