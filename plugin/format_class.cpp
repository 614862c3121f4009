// QrFormatKit: a cell format.
#include <cstddef>

#include "accessor_macros.h"
#include "class_constants.h"
#include "object_constructor.h"

namespace quire_plugin {

namespace {

FormatHandle fm(REALobject self) { return formatOf(self); }

QR_GET_INTEGER(borderDiagonalColor, fm, qrFormatBorderDiagonalColorW)
QR_SET_INTEGER(setBorderDiagonalColor, fm, qrFormatSetBorderDiagonalColorW)
QR_GET_INTEGER(borderDiagonalStyle, fm, qrFormatBorderDiagonalStyleW)
QR_SET_INTEGER(setBorderDiagonalStyle, fm, qrFormatSetBorderDiagonalStyleW)
QR_GET_INTEGER(borderDiagonal, fm, qrFormatBorderDiagonalW)
QR_SET_INTEGER(setBorderDiagonal, fm, qrFormatSetBorderDiagonalW)
QR_GET_INTEGER(patternBackgroundColor, fm, qrFormatPatternBackgroundColorW)
QR_SET_INTEGER(setPatternBackgroundColor, fm, qrFormatSetPatternBackgroundColorW)
QR_GET_INTEGER(patternForegroundColor, fm, qrFormatPatternForegroundColorW)
QR_SET_INTEGER(setPatternForegroundColor, fm, qrFormatSetPatternForegroundColorW)
QR_GET_INTEGER(fillPattern, fm, qrFormatFillPatternW)
QR_SET_INTEGER(setFillPattern, fm, qrFormatSetFillPatternW)
QR_GET_INTEGER(borderLeftColor, fm, qrFormatBorderLeftColorW)
QR_SET_INTEGER(setBorderLeftColor, fm, qrFormatSetBorderLeftColorW)
QR_GET_INTEGER(borderRightColor, fm, qrFormatBorderRightColorW)
QR_SET_INTEGER(setBorderRightColor, fm, qrFormatSetBorderRightColorW)
QR_GET_INTEGER(borderTopColor, fm, qrFormatBorderTopColorW)
QR_SET_INTEGER(setBorderTopColor, fm, qrFormatSetBorderTopColorW)
QR_GET_INTEGER(borderBottomColor, fm, qrFormatBorderBottomColorW)
QR_SET_INTEGER(setBorderBottomColor, fm, qrFormatSetBorderBottomColorW)
QR_GET_INTEGER(borderLeft, fm, qrFormatBorderLeftW)
QR_SET_INTEGER(setBorderLeft, fm, qrFormatSetBorderLeftW)
QR_GET_INTEGER(borderRight, fm, qrFormatBorderRightW)
QR_SET_INTEGER(setBorderRight, fm, qrFormatSetBorderRightW)
QR_GET_INTEGER(borderTop, fm, qrFormatBorderTopW)
QR_SET_INTEGER(setBorderTop, fm, qrFormatSetBorderTopW)
QR_GET_INTEGER(borderBottom, fm, qrFormatBorderBottomW)
QR_SET_INTEGER(setBorderBottom, fm, qrFormatSetBorderBottomW)
QR_GET_INTEGER(rotation, fm, qrFormatRotationW)
QR_GET_BOOLEAN(hidden, fm, qrFormatHiddenW)
QR_SET_BOOLEAN(setHidden, fm, qrFormatSetHiddenW)
QR_GET_BOOLEAN(locked, fm, qrFormatLockedW)
QR_SET_BOOLEAN(setLocked, fm, qrFormatSetLockedW)
QR_GET_BOOLEAN(shrinkToFit, fm, qrFormatShrinkToFitW)
QR_SET_BOOLEAN(setShrinkToFit, fm, qrFormatSetShrinkToFitW)
QR_GET_INTEGER(indent, fm, qrFormatIndentW)
QR_SET_INTEGER(setIndent, fm, qrFormatSetIndentW)
QR_GET_BOOLEAN(wrap, fm, qrFormatWrapW)
QR_SET_BOOLEAN(setWrap, fm, qrFormatSetWrapW)
QR_GET_INTEGER(alignH, fm, qrFormatAlignHW)
QR_SET_INTEGER(setAlignH, fm, qrFormatSetAlignHW)
QR_GET_INTEGER(alignV, fm, qrFormatAlignVW)
QR_SET_INTEGER(setAlignV, fm, qrFormatSetAlignVW)
QR_GET_INTEGER(numFormat, fm, qrFormatNumFormatW)
QR_SET_INTEGER(setNumFormat, fm, qrFormatSetNumFormatW)

REALobject font(REALobject self, RBInteger) {
    if (!QR_NEED(qrFormatFontW) || !requireHandle(fm(self))) return nullptr;
    return wrapHandle(fontClass(), QR_CALL(qrFormatFontW)(fm(self)), self);
}

RBBoolean formatSetFontMethod(REALobject self, REALobject font) {
    if (!QR_NEED(qrFormatSetFontW) || !requireHandle(fm(self))) return false;
    if (!requireArgument(font, "font", "font is nil")) return false;
    return hostBool(QR_CALL(qrFormatSetFontW)(fm(self), fontOf(font)));
}

void setFont(REALobject self, RBInteger, REALobject font) { formatSetFontMethod(self, font); }

void formatSetBorderColor(REALobject self, RBInteger color) {
    if (!QR_NEED(qrFormatSetBorderColorW) || !requireHandle(fm(self))) return;
    QR_CALL(qrFormatSetBorderColorW)(fm(self), static_cast<int>(color));
}

void formatSetBorder(REALobject self, RBInteger style) {
    if (!QR_NEED(qrFormatSetBorderW) || !requireHandle(fm(self))) return;
    QR_CALL(qrFormatSetBorderW)(fm(self), static_cast<int>(style));
}

RBBoolean formatSetRotation(REALobject self, RBInteger rotation) {
    if (!QR_NEED(qrFormatSetRotationW) || !requireHandle(fm(self))) return false;
    return hostBool(QR_CALL(qrFormatSetRotationW)(fm(self), static_cast<int>(rotation)));
}

void destructor(REALobject self) { releaseWrapper(self, formatClass()); }

REALproperty properties[] = {
    QR_FIELD_PROPERTY("Handle", "Integer", handle, true),
    QR_FIELD_PROPERTY("Owner", "Variant", owner, false),
    QR_PROPERTY("BorderDiagonalColor", "Integer", &borderDiagonalColor, &setBorderDiagonalColor),
    QR_PROPERTY("BorderDiagonalStyle", "Integer", &borderDiagonalStyle, &setBorderDiagonalStyle),
    QR_PROPERTY("BorderDiagonal", "Integer", &borderDiagonal, &setBorderDiagonal),
    QR_PROPERTY("PatternBackgroundColor", "Integer", &patternBackgroundColor, &setPatternBackgroundColor),
    QR_PROPERTY("PatternForegroundColor", "Integer", &patternForegroundColor, &setPatternForegroundColor),
    QR_PROPERTY("FillPattern", "Integer", &fillPattern, &setFillPattern),
    QR_PROPERTY("Font", "QrFontKit", &font, &setFont),
    QR_PROPERTY("BorderLeftColor", "Integer", &borderLeftColor, &setBorderLeftColor),
    QR_PROPERTY("BorderRightColor", "Integer", &borderRightColor, &setBorderRightColor),
    QR_PROPERTY("BorderTopColor", "Integer", &borderTopColor, &setBorderTopColor),
    QR_PROPERTY("BorderBottomColor", "Integer", &borderBottomColor, &setBorderBottomColor),
    QR_PROPERTY("BorderLeft", "Integer", &borderLeft, &setBorderLeft),
    QR_PROPERTY("BorderRight", "Integer", &borderRight, &setBorderRight),
    QR_PROPERTY("BorderTop", "Integer", &borderTop, &setBorderTop),
    QR_PROPERTY("BorderBottom", "Integer", &borderBottom, &setBorderBottom),
    QR_PROPERTY("Rotation", "Integer", &rotation, nullptr),
    QR_PROPERTY("Hidden", "Boolean", &hidden, &setHidden),
    QR_PROPERTY("Locked", "Boolean", &locked, &setLocked),
    QR_PROPERTY("ShrinkToFit", "Boolean", &shrinkToFit, &setShrinkToFit),
    QR_PROPERTY("Indent", "Integer", &indent, &setIndent),
    QR_PROPERTY("Wrap", "Boolean", &wrap, &setWrap),
    QR_PROPERTY("AlignH", "Integer", &alignH, &setAlignH),
    QR_PROPERTY("AlignV", "Integer", &alignV, &setAlignV),
    QR_PROPERTY("NumFormat", "Integer", &numFormat, &setNumFormat),
};

REALmethodDefinition methods[] = {
    {reinterpret_cast<REALproc>(&formatSetFontMethod), nullptr,
     "SetFont(font as QrFontKit) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&formatSetBorderColor), nullptr,
     "SetBorderColor(ColorValue as integer)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&formatSetBorder), nullptr,
     "SetBorder(border as integer = 1)",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&formatSetRotation), nullptr,
     "SetRotation(rotation as integer) as boolean",
     kMethodFlags, 0, nullptr},
    {reinterpret_cast<REALproc>(&objectConstructor), nullptr,
     "Constructor",
     kConstructorFlags, 0, nullptr},
};

}  // namespace

REALclassDefinition& formatClass() {
    static REALclassDefinition definition = {
        kCurrentREALControlVersion, "QrFormatKit", nullptr, sizeof(ObjectData), 0, nullptr,
        reinterpret_cast<REALproc>(&destructor), properties, sizeof properties / sizeof properties[0], methods,
        sizeof methods / sizeof methods[0], nullptr, 0, nullptr, 0, nullptr, nullptr, 0, formatConstants().list,
        formatConstants().count, kClassFlags, nullptr, 0, nullptr, 0, nullptr, 0, nullptr, 0};
    return definition;
}

}  // namespace quire_plugin
