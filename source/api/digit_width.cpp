#include "api/digit_width.h"

#include <fontconfig/fontconfig.h>
#include <ft2build.h>
#include FT_FREETYPE_H

#include <cmath>
#include <cwctype>
#include <map>
#include <mutex>
#include <utility>

#include "api/wide_text.h"

namespace quire {

namespace {

std::string lowerCase(std::string text) {
    for (char& ch : text)
        if (ch >= 'A' && ch <= 'Z') ch = static_cast<char>(ch - 'A' + 'a');
    return text;
}

// Families whose glyphs have the same advance widths as the family asked for.
bool sameMetrics(const std::string& wanted, const std::string& found) {
    if (wanted == found) return true;
    static const std::pair<const char*, const char*> kStandIns[] = {
        {"arial", "liberation sans"},         {"helvetica", "liberation sans"},
        {"times new roman", "liberation serif"}, {"courier new", "liberation mono"},
        {"calibri", "carlito"},               {"cambria", "caladea"},
    };
    for (const auto& [family, standIn] : kStandIns)
        if (wanted == family && found == standIn) return true;
    return false;
}

// The font file fontconfig picks for a family, when it is that family or a stand-in.
bool findFontFile(const std::string& family, std::string& path, int& faceIndex) {
    if (!FcInit()) return false;
    FcPattern* pattern = FcNameParse(reinterpret_cast<const FcChar8*>(""));
    if (!pattern) return false;
    FcPatternAddString(pattern, FC_FAMILY, reinterpret_cast<const FcChar8*>(family.c_str()));
    FcPatternAddInteger(pattern, FC_WEIGHT, FC_WEIGHT_REGULAR);
    FcPatternAddInteger(pattern, FC_SLANT, FC_SLANT_ROMAN);
    FcConfigSubstitute(nullptr, pattern, FcMatchPattern);
    FcDefaultSubstitute(pattern);
    FcResult result = FcResultNoMatch;
    FcPattern* match = FcFontMatch(nullptr, pattern, &result);
    FcPatternDestroy(pattern);
    if (!match) return false;
    bool found = false;
    FcChar8* matchedFamily = nullptr;
    FcChar8* file = nullptr;
    if (FcPatternGetString(match, FC_FAMILY, 0, &matchedFamily) == FcResultMatch &&
        FcPatternGetString(match, FC_FILE, 0, &file) == FcResultMatch &&
        sameMetrics(lowerCase(family), lowerCase(reinterpret_cast<const char*>(matchedFamily)))) {
        path = reinterpret_cast<const char*>(file);
        if (FcPatternGetInteger(match, FC_INDEX, 0, &faceIndex) != FcResultMatch) faceIndex = 0;
        found = true;
    }
    FcPatternDestroy(match);
    return found;
}

int measure(const std::string& family, double pixelSize) {
    std::string path;
    int faceIndex = 0;
    if (!findFontFile(family, path, faceIndex)) return 0;
    FT_Library library = nullptr;
    if (FT_Init_FreeType(&library) != 0) return 0;
    int widest = 0;
    FT_Face face = nullptr;
    if (FT_New_Face(library, path.c_str(), faceIndex, &face) == 0) {
        // At 72 dots per inch a point is a pixel: the size is given in 26.6 fixed point.
        const auto size = static_cast<FT_F26Dot6>(std::lround(pixelSize * 64));
        if (FT_Set_Char_Size(face, 0, size, 72, 72) == 0) {
            for (char digit = '0'; digit <= '9'; ++digit) {
                const FT_UInt glyph = FT_Get_Char_Index(face, static_cast<FT_ULong>(digit));
                if (glyph == 0 || FT_Load_Glyph(face, glyph, FT_LOAD_DEFAULT) != 0) continue;
                const int advance = static_cast<int>((face->glyph->advance.x + 32) >> 6);
                if (advance > widest) widest = advance;
            }
        }
        FT_Done_Face(face);
    }
    FT_Done_FreeType(library);
    return widest;
}

}  // namespace

int measureMaxDigitWidth(const std::wstring& family, double pixelSize) {
    if (family.empty() || !(pixelSize > 0 && pixelSize < 4096)) return 0;
    static std::mutex guard;
    static std::map<std::pair<std::string, long>, int> measured;
    const std::string name = toUtf8(family);
    const auto key = std::make_pair(name, std::lround(pixelSize * 64));
    std::lock_guard<std::mutex> lock(guard);
    const auto found = measured.find(key);
    if (found != measured.end()) return found->second;
    const int width = measure(name, pixelSize);
    measured.emplace(key, width);
    return width;
}

}  // namespace quire
