#pragma once
#include <string>

namespace quire {

// What a book's setLocale decides: UTF-8 conversion of names and the formula list separator.
struct LocaleSettings {
    bool utf8Mode = false;
    wchar_t listSeparator = L';';
    std::string previousCtype;  // the process's character-type locale before the last change
};

// Applies a locale name; throws qrerror("setlocale error (1)" / "(2)") on failure.
void applyLocale(LocaleSettings& settings, const char* locale);

// ';' when the runtime's locale name names a country that writes decimal commas.
wchar_t listSeparatorForLocaleName(const std::string& localeName);

}  // namespace quire
