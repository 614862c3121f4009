// Font entry points of the C interface: each forwards to one IFont operation.
#include "handles.h"

using namespace quire::flat;

extern "C" {

int qrFontSizeW(FontHandle font) { return asFont(font)->size(); }

void qrFontSetSizeW(FontHandle font, int size) { asFont(font)->setSize(size); }

int qrFontItalicW(FontHandle font) { return asFont(font)->italic(); }

void qrFontSetItalicW(FontHandle font, int italic) { asFont(font)->setItalic(isTrue(italic)); }

int qrFontStrikeOutW(FontHandle font) { return asFont(font)->strikeOut(); }

void qrFontSetStrikeOutW(FontHandle font, int strikeOut) {
    asFont(font)->setStrikeOut(isTrue(strikeOut));
}

int qrFontColorW(FontHandle font) { return asFont(font)->color(); }

void qrFontSetColorW(FontHandle font, int color) { asFont(font)->setColor(color); }

int qrFontBoldW(FontHandle font) { return asFont(font)->bold(); }

void qrFontSetBoldW(FontHandle font, int bold) { asFont(font)->setBold(isTrue(bold)); }

int qrFontScriptW(FontHandle font) { return asFont(font)->script(); }

void qrFontSetScriptW(FontHandle font, int script) { asFont(font)->setScript(script); }

int qrFontUnderlineW(FontHandle font) { return asFont(font)->underline(); }

void qrFontSetUnderlineW(FontHandle font, int underline) { asFont(font)->setUnderline(underline); }

const wchar_t* qrFontNameW(FontHandle font) { return asFont(font)->name(); }

int qrFontSetNameW(FontHandle font, const wchar_t* name) { return asFont(font)->setName(name); }

}  // extern "C"
