// Format entry points of the C interface: each forwards to one IFormat operation.
#include "handles.h"

using namespace quire::flat;

extern "C" {

FontHandle qrFormatFontW(FormatHandle format) { return toHandle(asFormat(format)->font()); }

int qrFormatSetFontW(FormatHandle format, FontHandle font) {
    return asFormat(format)->setFont(asFont(font));
}

int qrFormatNumFormatW(FormatHandle format) { return asFormat(format)->numFormat(); }

void qrFormatSetNumFormatW(FormatHandle format, int numFormat) {
    asFormat(format)->setNumFormat(numFormat);
}

int qrFormatAlignHW(FormatHandle format) { return asFormat(format)->alignH(); }

void qrFormatSetAlignHW(FormatHandle format, int align) { asFormat(format)->setAlignH(align); }

int qrFormatAlignVW(FormatHandle format) { return asFormat(format)->alignV(); }

void qrFormatSetAlignVW(FormatHandle format, int align) { asFormat(format)->setAlignV(align); }

int qrFormatWrapW(FormatHandle format) { return asFormat(format)->wrap(); }

void qrFormatSetWrapW(FormatHandle format, int wrap) { asFormat(format)->setWrap(isTrue(wrap)); }

int qrFormatRotationW(FormatHandle format) { return asFormat(format)->rotation(); }

int qrFormatSetRotationW(FormatHandle format, int rotation) {
    return asFormat(format)->setRotation(rotation);
}

int qrFormatIndentW(FormatHandle format) { return asFormat(format)->indent(); }

void qrFormatSetIndentW(FormatHandle format, int indent) { asFormat(format)->setIndent(indent); }

int qrFormatShrinkToFitW(FormatHandle format) { return asFormat(format)->shrinkToFit(); }

void qrFormatSetShrinkToFitW(FormatHandle format, int shrinkToFit) {
    asFormat(format)->setShrinkToFit(isTrue(shrinkToFit));
}

void qrFormatSetBorderW(FormatHandle format, int style) { asFormat(format)->setBorder(style); }

void qrFormatSetBorderColorW(FormatHandle format, int color) {
    asFormat(format)->setBorderColor(color);
}

int qrFormatBorderLeftW(FormatHandle format) { return asFormat(format)->borderLeft(); }

void qrFormatSetBorderLeftW(FormatHandle format, int style) {
    asFormat(format)->setBorderLeft(style);
}

int qrFormatBorderRightW(FormatHandle format) { return asFormat(format)->borderRight(); }

void qrFormatSetBorderRightW(FormatHandle format, int style) {
    asFormat(format)->setBorderRight(style);
}

int qrFormatBorderTopW(FormatHandle format) { return asFormat(format)->borderTop(); }

void qrFormatSetBorderTopW(FormatHandle format, int style) { asFormat(format)->setBorderTop(style); }

int qrFormatBorderBottomW(FormatHandle format) { return asFormat(format)->borderBottom(); }

void qrFormatSetBorderBottomW(FormatHandle format, int style) {
    asFormat(format)->setBorderBottom(style);
}

int qrFormatBorderLeftColorW(FormatHandle format) { return asFormat(format)->borderLeftColor(); }

void qrFormatSetBorderLeftColorW(FormatHandle format, int color) {
    asFormat(format)->setBorderLeftColor(color);
}

int qrFormatBorderRightColorW(FormatHandle format) { return asFormat(format)->borderRightColor(); }

void qrFormatSetBorderRightColorW(FormatHandle format, int color) {
    asFormat(format)->setBorderRightColor(color);
}

int qrFormatBorderTopColorW(FormatHandle format) { return asFormat(format)->borderTopColor(); }

void qrFormatSetBorderTopColorW(FormatHandle format, int color) {
    asFormat(format)->setBorderTopColor(color);
}

int qrFormatBorderBottomColorW(FormatHandle format) {
    return asFormat(format)->borderBottomColor();
}

void qrFormatSetBorderBottomColorW(FormatHandle format, int color) {
    asFormat(format)->setBorderBottomColor(color);
}

int qrFormatBorderDiagonalW(FormatHandle format) { return asFormat(format)->borderDiagonal(); }

void qrFormatSetBorderDiagonalW(FormatHandle format, int border) {
    asFormat(format)->setBorderDiagonal(border);
}

int qrFormatBorderDiagonalStyleW(FormatHandle format) {
    return asFormat(format)->borderDiagonalStyle();
}

void qrFormatSetBorderDiagonalStyleW(FormatHandle format, int style) {
    asFormat(format)->setBorderDiagonalStyle(style);
}

int qrFormatBorderDiagonalColorW(FormatHandle format) {
    return asFormat(format)->borderDiagonalColor();
}

void qrFormatSetBorderDiagonalColorW(FormatHandle format, int color) {
    asFormat(format)->setBorderDiagonalColor(color);
}

int qrFormatFillPatternW(FormatHandle format) { return asFormat(format)->fillPattern(); }

void qrFormatSetFillPatternW(FormatHandle format, int pattern) {
    asFormat(format)->setFillPattern(pattern);
}

int qrFormatPatternForegroundColorW(FormatHandle format) {
    return asFormat(format)->patternForegroundColor();
}

void qrFormatSetPatternForegroundColorW(FormatHandle format, int color) {
    asFormat(format)->setPatternForegroundColor(color);
}

int qrFormatPatternBackgroundColorW(FormatHandle format) {
    return asFormat(format)->patternBackgroundColor();
}

void qrFormatSetPatternBackgroundColorW(FormatHandle format, int color) {
    asFormat(format)->setPatternBackgroundColor(color);
}

int qrFormatLockedW(FormatHandle format) { return asFormat(format)->locked(); }

void qrFormatSetLockedW(FormatHandle format, int locked) {
    asFormat(format)->setLocked(isTrue(locked));
}

int qrFormatHiddenW(FormatHandle format) { return asFormat(format)->hidden(); }

void qrFormatSetHiddenW(FormatHandle format, int hidden) {
    asFormat(format)->setHidden(isTrue(hidden));
}

}  // extern "C"
