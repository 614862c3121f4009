// QrFontKit: a font.
#include <cstddef>

#include "accessor_macros.h"
#include "class_constants.h"
#include "object_constructor.h"

namespace quire_plugin {

namespace {

FontHandle fo(REALobject self) { return fontOf(self); }

QR_GET_INTEGER(size, fo, qrFontSizeW)
QR_SET_INTEGER(setSize, fo, qrFontSetSizeW)
QR_GET_BOOLEAN(italic, fo, qrFontItalicW)
QR_SET_BOOLEAN(setItalic, fo, qrFontSetItalicW)
QR_GET_BOOLEAN(strikeOut, fo, qrFontStrikeOutW)
QR_SET_BOOLEAN(setStrikeOut, fo, qrFontSetStrikeOutW)
QR_GET_INTEGER(underline, fo, qrFontUnderlineW)
QR_SET_INTEGER(setUnderline, fo, qrFontSetUnderlineW)
QR_GET_BOOLEAN(bold, fo, qrFontBoldW)
QR_SET_BOOLEAN(setBold, fo, qrFontSetBoldW)
QR_GET_INTEGER(script, fo, qrFontScriptW)
QR_SET_INTEGER(setScript, fo, qrFontSetScriptW)
QR_GET_STRING(name, fo, qrFontNameW)
QR_SET_STRING(setName, fo, qrFontSetNameW)
QR_GET_INTEGER(colorValue, fo, qrFontColorW)
QR_SET_INTEGER(setColorValue, fo, qrFontSetColorW)

void destructor(REALobject self) { releaseWrapper(self, fontClass()); }

REALproperty properties[] = {
    QR_FIELD_PROPERTY("Handle", "Integer", handle, true),
    QR_FIELD_PROPERTY("Owner", "Variant", owner, false),
    QR_PROPERTY("Size", "Integer", &size, &setSize),
    QR_PROPERTY("Italic", "Boolean", &italic, &setItalic),
    QR_PROPERTY("StrikeOut", "Boolean", &strikeOut, &setStrikeOut),
    QR_PROPERTY("Underline", "Integer", &underline, &setUnderline),
    QR_PROPERTY("Bold", "Boolean", &bold, &setBold),
    QR_PROPERTY("Script", "Integer", &script, &setScript),
    QR_PROPERTY("Name", "String", &name, &setName),
    QR_PROPERTY("ColorValue", "Integer", &colorValue, &setColorValue),
};

REALmethodDefinition methods[] = {
    {reinterpret_cast<REALproc>(&objectConstructor), nullptr,
     "Constructor",
     kConstructorFlags, 0, nullptr},
};

}  // namespace

REALclassDefinition& fontClass() {
    static REALclassDefinition definition = {
        kCurrentREALControlVersion, "QrFontKit", nullptr, sizeof(ObjectData), 0, nullptr,
        reinterpret_cast<REALproc>(&destructor), properties, sizeof properties / sizeof properties[0], methods,
        sizeof methods / sizeof methods[0], nullptr, 0, nullptr, 0, nullptr, nullptr, 0, fontConstants().list,
        fontConstants().count, kClassFlags, nullptr, 0, nullptr, 0, nullptr, 0, nullptr, 0};
    return definition;
}

}  // namespace quire_plugin
