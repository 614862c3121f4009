// Cell formats and fonts through QrFormatKit and QrFontKit: every property both ways, the methods,
// the owners they keep alive, and the values surviving a save and load.
#include "test_support.h"

namespace plugintest {
namespace {

Integer formatConstant(const std::string& name) { return host().constant("QrFormatKit", name); }
Integer fontConstant(const std::string& name) { return host().constant("QrFontKit", name); }

Integer getInteger(const Value& self, const std::string& property) {
    Held value(host().get(self, property));
    EXPECT_FALSE(host().raised()) << property << ": " << host().exceptionMessage();
    return value.v.i;
}

bool getBoolean(const Value& self, const std::string& property) {
    Held value(host().get(self, property));
    EXPECT_FALSE(host().raised()) << property << ": " << host().exceptionMessage();
    return value.v.b;
}

struct IntegerSetting {
    const char* property;
    Integer value;
};

// Integer properties of a format with a value that differs from a new format's.
std::vector<IntegerSetting> formatIntegers() {
    return {
        {"BorderDiagonalColor", fontConstant("ColorRed")},
        {"BorderDiagonalStyle", formatConstant("BorderStyleDashed")},
        {"BorderDiagonal", formatConstant("BorderDiagonalBoth")},
        {"PatternBackgroundColor", fontConstant("ColorBlue")},
        {"PatternForegroundColor", fontConstant("ColorLightyellow")},
        {"FillPattern", formatConstant("FillPatternSolid")},
        {"BorderLeftColor", fontConstant("ColorGreen")},
        {"BorderRightColor", fontConstant("ColorTeal")},
        {"BorderTopColor", fontConstant("ColorViolet")},
        {"BorderBottomColor", fontConstant("ColorGray50")},
        {"BorderLeft", formatConstant("BorderStyleThin")},
        {"BorderRight", formatConstant("BorderStyleMedium")},
        {"BorderTop", formatConstant("BorderStyleThick")},
        {"BorderBottom", formatConstant("BorderStyleDouble")},
        {"Indent", 3},
        {"AlignH", formatConstant("AlignHCenter")},
        {"AlignV", formatConstant("AlignVTop")},
        {"NumFormat", formatConstant("NumformatPercentD2")},
    };
}

const char* const kFormatFlags[] = {"Hidden", "Locked", "ShrinkToFit", "Wrap"};

void expectFormatValues(const Value& format) {
    for (const IntegerSetting& s : formatIntegers()) EXPECT_EQ(getInteger(format, s.property), s.value) << s.property;
    EXPECT_TRUE(getBoolean(format, "Hidden"));
    EXPECT_FALSE(getBoolean(format, "Locked"));
    EXPECT_TRUE(getBoolean(format, "ShrinkToFit"));
    EXPECT_TRUE(getBoolean(format, "Wrap"));
    EXPECT_EQ(getInteger(format, "Rotation"), 90);
}

TEST(FormatKit, EveryPropertyBothWays) {
    Held book(newBook());
    Held format(host().call(book.v, "AddFormat"));
    ASSERT_EQ(Host::className(format.v), "QrFormatKit");
    Held owner(host().get(format.v, "Owner"));
    EXPECT_EQ(owner.v.o, book.v.o);
    EXPECT_NE(getInteger(format.v, "Handle"), 0);
    // A new format is locked and shows its text unwrapped.
    EXPECT_TRUE(getBoolean(format.v, "Locked"));
    EXPECT_FALSE(getBoolean(format.v, "Wrap"));
    for (const IntegerSetting& s : formatIntegers()) {
        host().set(format.v, s.property, integer(s.value));
        EXPECT_FALSE(host().raised()) << s.property;
    }
    for (const char* flag : kFormatFlags) host().set(format.v, flag, boolean(std::string(flag) != "Locked"));
    Held rotated(host().call(format.v, "SetRotation", {integer(90)}));
    EXPECT_TRUE(rotated.v.b);
    expectFormatValues(format.v);
}

TEST(FormatKit, RotationOutsideItsRangeIsRefused) {
    Held book(newBook());
    Held format(host().call(book.v, "AddFormat"));
    Held ok(host().call(format.v, "SetRotation", {integer(45)}));
    EXPECT_TRUE(ok.v.b);
    Held refused(host().call(format.v, "SetRotation", {integer(181)}));
    EXPECT_FALSE(refused.v.b);
    EXPECT_FALSE(host().raised()) << "library failures are not exceptions";
    Held message(host().get(book.v, "ErrorMessage"));
    EXPECT_EQ(Host::utf8(message.v), "rotation must be in range 0-180 or 255");
    EXPECT_EQ(getInteger(format.v, "Rotation"), 45);
    Held vertical(host().call(format.v, "SetRotation", {integer(255)}));
    EXPECT_TRUE(vertical.v.b);
    EXPECT_EQ(getInteger(format.v, "Rotation"), 255);
}

TEST(FormatKit, BorderAndBorderColorSetAllFourSides) {
    Held book(newBook());
    Held format(host().call(book.v, "AddFormat"));
    host().call(format.v, "SetBorder");  // the default style: thin
    for (const char* side : {"BorderLeft", "BorderRight", "BorderTop", "BorderBottom"})
        EXPECT_EQ(getInteger(format.v, side), formatConstant("BorderStyleThin")) << side;
    host().call(format.v, "SetBorder", {integer(formatConstant("BorderStyleDashdot"))});
    host().call(format.v, "SetBorderColor", {integer(fontConstant("ColorRed"))});
    for (const char* side : {"BorderLeft", "BorderRight", "BorderTop", "BorderBottom"})
        EXPECT_EQ(getInteger(format.v, side), formatConstant("BorderStyleDashdot")) << side;
    for (const char* side : {"BorderLeftColor", "BorderRightColor", "BorderTopColor", "BorderBottomColor"})
        EXPECT_EQ(getInteger(format.v, side), fontConstant("ColorRed")) << side;
}

TEST(FormatKit, FontPropertyAndSetFont) {
    Held book(newBook());
    Held format(host().call(book.v, "AddFormat"));
    Held font(host().call(book.v, "AddFont"));
    host().set(font.v, "Size", integer(17));
    Held set(host().call(format.v, "SetFont", {font.v}));
    EXPECT_TRUE(set.v.b);
    Held current(host().get(format.v, "Font"));
    ASSERT_EQ(Host::className(current.v), "QrFontKit");
    // A new wrapper of the same library font, owned by the format.
    EXPECT_NE(current.v.o, font.v.o);
    EXPECT_EQ(getInteger(current.v, "Handle"), getInteger(font.v, "Handle"));
    Held owner(host().get(current.v, "Owner"));
    EXPECT_EQ(owner.v.o, format.v.o);
    EXPECT_EQ(getInteger(current.v, "Size"), 17);

    Held other(host().call(book.v, "AddFont"));
    host().set(format.v, "Font", other.v);
    EXPECT_FALSE(host().raised());
    Held changed(host().get(format.v, "Font"));
    EXPECT_EQ(getInteger(changed.v, "Handle"), getInteger(other.v, "Handle"));
    host().set(format.v, "Font", nil());
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
    EXPECT_EQ(host().exceptionMessage(), "font is nil");
}

TEST(FormatKit, InitialFormatIsCopied) {
    Held book(newBook());
    Held first(host().call(book.v, "AddFormat"));
    host().set(first.v, "AlignH", integer(formatConstant("AlignHRight")));
    host().set(first.v, "FillPattern", integer(formatConstant("FillPatternGray50")));
    Held copy(host().call(book.v, "AddFormat", {first.v}));
    EXPECT_NE(getInteger(copy.v, "Handle"), getInteger(first.v, "Handle"));
    EXPECT_EQ(getInteger(copy.v, "AlignH"), formatConstant("AlignHRight"));
    EXPECT_EQ(getInteger(copy.v, "FillPattern"), formatConstant("FillPatternGray50"));
}

TEST(FormatKit, WrappersKeepTheirOwnersAlive) {
    int before = Host::liveObjects();
    {
        Value book = newBook();
        Value format = host().call(book, "AddFormat");
        Value font = host().get(format, "Font");
        Host::release(book);
        Host::release(format);
        // The font keeps the format, the format keeps the book: the library objects stay usable.
        host().set(font, "Italic", boolean(true));
        EXPECT_FALSE(host().raised());
        EXPECT_TRUE(getBoolean(font, "Italic"));
        Host::release(font);
    }
    EXPECT_EQ(Host::liveObjects(), before);
}

TEST(FormatKit, FormatsArrayAndIndexChecks) {
    Held book(newBook());
    Held added(host().call(book.v, "AddFormat"));
    Held count(host().call(book.v, "FormatCount"));
    ASSERT_GT(count.v.i, 0);
    Held formats(host().call(book.v, "Formats"));
    auto elements = Host::arrayElements(formats.v);
    ASSERT_EQ(static_cast<Integer>(elements.size()), count.v.i);
    Held last(host().call(book.v, "Format", {integer(count.v.i - 1)}));
    EXPECT_EQ(getInteger(last.v, "Handle"), getInteger(added.v, "Handle"));
    EXPECT_EQ(getInteger(elements.back(), "Handle"), getInteger(added.v, "Handle"));
    for (auto& e : elements) {
        Held owner(host().get(e, "Owner"));
        EXPECT_EQ(owner.v.o, book.v.o);
        Host::release(e);
    }
    Held below(host().call(book.v, "Format", {integer(-1)}));
    EXPECT_EQ(below.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "OutOfBoundsException");
    EXPECT_EQ(host().exceptionMessage(), "The parameter index to method Format is too small. Range is 0 to " +
                                             std::to_string(count.v.i - 1) + ", but value is -1.");
}

TEST(FormatKit, ValuesSurviveSavingAndLoading) {
    Held book(newBook());
    Held sheet(host().call(book.v, "AddSheet", {text("Styles")}));
    Held format(host().call(book.v, "AddFormat"));
    for (const IntegerSetting& s : formatIntegers()) host().set(format.v, s.property, integer(s.value));
    for (const char* flag : kFormatFlags) host().set(format.v, flag, boolean(std::string(flag) != "Locked"));
    Held rotated(host().call(format.v, "SetRotation", {integer(90)}));
    Held font(host().call(book.v, "AddFont"));
    host().set(font.v, "Name", text("Liberation Serif"));
    host().set(font.v, "Bold", boolean(true));
    host().set(format.v, "Font", font.v);
    Held written(host().call(sheet.v, "WriteNumber", {integer(0), integer(0), dbl(0.25), format.v}));
    ASSERT_TRUE(written.v.b);
    Ref data = ref();
    Held saved(host().call(book.v, "SaveRaw(byref data as string) as boolean", {data}));
    if (!saved.v.b && notAvailableYet(book.v)) GTEST_SKIP() << "saving binary books is not built yet";
    ASSERT_TRUE(saved.v.b);
    Held copy(host().callShared("QrBookKit", "LoadRaw2(data as string) as QrBookKit", {*data}));
    Host::release(*data);
    ASSERT_EQ(Host::className(copy.v), "QrBookKit");
    Held loadedSheet(host().call(copy.v, "Sheet", {integer(0)}));
    Held loaded(host().call(loadedSheet.v, "CellFormat", {integer(0), integer(0)}));
    ASSERT_EQ(Host::className(loaded.v), "QrFormatKit");
    Held owner(host().get(loaded.v, "Owner"));
    EXPECT_EQ(owner.v.o, loadedSheet.v.o);
    expectFormatValues(loaded.v);
    Held loadedFont(host().get(loaded.v, "Font"));
    Held name(host().get(loadedFont.v, "Name"));
    EXPECT_EQ(Host::utf8(name.v), "Liberation Serif");
    EXPECT_TRUE(getBoolean(loadedFont.v, "Bold"));
}

TEST(FontKit, EveryPropertyBothWays) {
    Held book(newBook());
    Held font(host().call(book.v, "AddFont"));
    ASSERT_EQ(Host::className(font.v), "QrFontKit");
    Held owner(host().get(font.v, "Owner"));
    EXPECT_EQ(owner.v.o, book.v.o);
    host().set(font.v, "Size", integer(14));
    host().set(font.v, "Italic", boolean(true));
    host().set(font.v, "StrikeOut", boolean(true));
    host().set(font.v, "Underline", integer(fontConstant("UnderlineDouble")));
    host().set(font.v, "Bold", boolean(true));
    host().set(font.v, "Script", integer(fontConstant("ScriptSuper")));
    host().set(font.v, "Name", text("Caf\xC3\xA9 Sans"));
    host().set(font.v, "ColorValue", integer(fontConstant("ColorDarkred")));
    EXPECT_FALSE(host().raised());
    EXPECT_EQ(getInteger(font.v, "Size"), 14);
    EXPECT_TRUE(getBoolean(font.v, "Italic"));
    EXPECT_TRUE(getBoolean(font.v, "StrikeOut"));
    EXPECT_EQ(getInteger(font.v, "Underline"), fontConstant("UnderlineDouble"));
    EXPECT_TRUE(getBoolean(font.v, "Bold"));
    EXPECT_EQ(getInteger(font.v, "Script"), fontConstant("ScriptSuper"));
    Held name(host().get(font.v, "Name"));
    EXPECT_EQ(Host::utf8(name.v), "Caf\xC3\xA9 Sans");
    EXPECT_EQ(Host::encoding(name.v), kUtf8);
    EXPECT_EQ(getInteger(font.v, "ColorValue"), fontConstant("ColorDarkred"));

    host().set(font.v, "Italic", boolean(false));
    host().set(font.v, "Bold", boolean(false));
    EXPECT_FALSE(getBoolean(font.v, "Italic"));
    EXPECT_FALSE(getBoolean(font.v, "Bold"));
}

TEST(FontKit, ColourInRgbMode) {
    Held book(newBook());
    host().set(book.v, "RgbMode", boolean(true));
    Held font(host().call(book.v, "AddFont"));
    Held packed(host().call(book.v, "PackColor", {integer(0x20), integer(0x40), integer(0x60)}));
    host().set(font.v, "ColorValue", integer(packed.v.i));
    EXPECT_EQ(getInteger(font.v, "ColorValue"), packed.v.i);
}

TEST(FontKit, InitialFontIsCopiedAndFontsArray) {
    Held book(newBook());
    Held first(host().call(book.v, "AddFont"));
    host().set(first.v, "Name", text("Liberation Mono"));
    host().set(first.v, "Size", integer(9));
    Held copy(host().call(book.v, "AddFont", {first.v}));
    EXPECT_NE(getInteger(copy.v, "Handle"), getInteger(first.v, "Handle"));
    Held name(host().get(copy.v, "Name"));
    EXPECT_EQ(Host::utf8(name.v), "Liberation Mono");
    EXPECT_EQ(getInteger(copy.v, "Size"), 9);

    Held count(host().call(book.v, "FontCount"));
    Held fonts(host().call(book.v, "Fonts"));
    auto elements = Host::arrayElements(fonts.v);
    ASSERT_EQ(static_cast<Integer>(elements.size()), count.v.i);
    EXPECT_EQ(getInteger(elements.back(), "Handle"), getInteger(copy.v, "Handle"));
    for (auto& e : elements) Host::release(e);
    Held beyond(host().call(book.v, "Font", {integer(count.v.i)}));
    EXPECT_EQ(beyond.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionMessage(), "The parameter index to method Font is too big. Range is 0 to " +
                                             std::to_string(count.v.i - 1) + ", but value is " +
                                             std::to_string(count.v.i) + ".");
}

TEST(FontKit, EmptyNameReachesTheHostAsNil) {
    Held book(newBook());
    Held font(host().call(book.v, "AddFont"));
    host().set(font.v, "Name", nil());
    Held name(host().get(font.v, "Name"));
    EXPECT_EQ(name.v.kind, Value::Nil);
    EXPECT_FALSE(host().raised());
}

TEST(FormatKit, InstancesWithoutLibraryObject) {
    // Host code cannot make these itself; an instance that holds no library object raises.
    Held format(host().create("QrFormatKit"));
    Held align(host().get(format.v, "AlignH"));
    EXPECT_EQ(align.v.i, 0);
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    Held rotated(host().call(format.v, "SetRotation", {integer(10)}));
    EXPECT_FALSE(rotated.v.b);
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    Held font(host().create("QrFontKit"));
    host().set(font.v, "Name", text("x"));
    EXPECT_EQ(host().exceptionMessage(), "Object not initialized.");
    Held name(host().get(font.v, "Name"));
    EXPECT_EQ(name.v.kind, Value::Nil);
    EXPECT_EQ(host().exceptionClass(), "NilObjectException");
}

}  // namespace
}  // namespace plugintest
