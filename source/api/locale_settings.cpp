#include "locale_settings.h"

#include <clocale>
#include <cstring>

#include "qrerror.h"

namespace quire {
namespace {

// Countries whose decimal separator is a comma, each by its Windows name and its POSIX code.
const char* const kSemicolonCountries[][2] = {
    {"Azerbaijan", "_AZ."}, {"Belarus", "_BY."}, {"Bulgaria", "_BG."},
    {"Bosnia and Herzegovina", "_BA."}, {"Spain", "_ES."}, {"Czech Republic", "_CZ."},
    {"Denmark", "_DK."}, {"Austria", "_AT."}, {"Belgium", "_BE."}, {"Germany", "_DE."},
    {"Luxembourg", "_LU."}, {"Cyprus", "_CY."}, {"Greece", "_GR."}, {"Latin America", "_AN."},
    {"Estonia", "_EE."}, {"Finland", "_FI."}, {"Canada", "_CA."}, {"France", "_FR."},
    {"Croatia", "_HR."}, {"Hungary", "_HU."}, {"Indonesia", "_ID."}, {"Iceland", "_IS."},
    {"Italy", "_IT."}, {"Georgia", "_GE."}, {"Kazakhstan", "_KZ."}, {"Kyrgyzstan", "_KG."},
    {"Lithuania", "_LT."}, {"Latvia", "_LV."}, {"Madagascar", "_MG."}, {"Mongolia", "_MN."},
    {"Macedonia", "_MK."}, {"Norway", "_NO."}, {"Netherlands", "_NL."}, {"Afghanistan", "_AW."},
    {"Poland", "_PL."}, {"Brazil", "_BR."}, {"Portugal", "_PT."}, {"Romania", "_RO."},
    {"Russia", "_RU."}, {"Ukraine", "_UA."}, {"Kinyarwanda", "_RW."}, {"Slovakia", "_SK."},
    {"Slovenia", "_SI."}, {"Montenegro", "_ME."}, {"Albania", "_AL."}, {"Serbia", "_RS."},
    {"Sweden", "_SE."}, {"Tajikistan", "_TJ."}, {"Turkey", "_TR."}, {"Senegal", "_SN."},
    {"Morocco", "_MA."}, {"South Africa", "_ZA."},
};

}  // namespace

wchar_t listSeparatorForLocaleName(const std::string& localeName) {
    for (const auto& pair : kSemicolonCountries) {
        if (localeName.find(pair[0]) != std::string::npos ||
            localeName.find(pair[1]) != std::string::npos)
            return L';';
    }
    return L',';
}

void applyLocale(LocaleSettings& settings, const char* locale) {
    if (!locale) throw qrerror("setlocale error (1)");
    if (std::strcmp(locale, "UTF-8") == 0 || std::strcmp(locale, "UTF-8.semicolon") == 0) {
        settings.utf8Mode = true;
        settings.listSeparator = L';';
        return;
    }
    if (std::strcmp(locale, "UTF-8.comma") == 0) {
        settings.utf8Mode = true;
        settings.listSeparator = L',';
        return;
    }
    settings.utf8Mode = false;
    const char* current = std::setlocale(LC_CTYPE, nullptr);
    settings.previousCtype = current ? current : "";
    const char* applied = std::setlocale(LC_CTYPE, locale);
    if (!applied) {
        settings.listSeparator = L';';
        throw qrerror("setlocale error (2)");
    }
    settings.listSeparator = listSeparatorForLocaleName(applied);
}

}  // namespace quire
