#pragma once
// The host methods and property accessors of QrBookKit.
#include "host_sdk.h"

namespace quire_plugin {

// Storage
RBBoolean bookLoadRawPartiallyString(REALobject self, REALstring data, RBInteger sheet, RBInteger first, RBInteger last);
RBBoolean bookLoadRawPartiallyBlock(REALobject self, REALobject data, RBInteger sheet, RBInteger first, RBInteger last);
RBBoolean bookLoadPartiallyString(REALobject self, REALstring path, RBInteger sheet, RBInteger first, RBInteger last);
RBBoolean bookLoadPartiallyFolder(REALobject self, REALobject path, RBInteger sheet, RBInteger first, RBInteger last);
RBBoolean bookLoadPartiallyTempString(REALobject self, REALstring path, RBInteger sheet, RBInteger first, RBInteger last,
                                      REALstring tempFile);
RBBoolean bookLoadPartiallyTempFolder(REALobject self, REALobject path, RBInteger sheet, RBInteger first, RBInteger last,
                                      REALobject tempFile);
RBBoolean bookSaveTempString(REALobject self, REALstring path, RBBoolean useTempFile);
RBBoolean bookSaveTempFolder(REALobject self, REALobject path, RBBoolean useTempFile);
RBBoolean bookLoadTempString(REALobject self, REALstring path, REALstring tempFile);
RBBoolean bookLoadTempFolder(REALobject self, REALobject path, REALobject tempFile);
RBBoolean bookSaveString(REALobject self, REALstring path);
RBBoolean bookSaveFolder(REALobject self, REALobject path);
RBBoolean bookLoadString(REALobject self, REALstring path);
RBBoolean bookLoadFolder(REALobject self, REALobject path);
RBBoolean bookSaveRawString(REALobject self, REALstring* data);
RBBoolean bookSaveRawBlock(REALobject self, REALobject* data);
RBBoolean bookLoadRawString(REALobject self, REALstring data);
RBBoolean bookLoadRawBlock(REALobject self, REALobject data);
RBBoolean bookSaveMTString(REALobject self, REALstring path);
RBBoolean bookSaveMTFolder(REALobject self, REALobject path);
RBBoolean bookLoadMTString(REALobject self, REALstring path);
RBBoolean bookLoadMTFolder(REALobject self, REALobject path);
RBBoolean bookSaveRawMTString(REALobject self, REALstring* data);
RBBoolean bookSaveRawMTBlock(REALobject self, REALobject* data);
RBBoolean bookLoadRawMTString(REALobject self, REALstring data);
RBBoolean bookLoadRawMTBlock(REALobject self, REALobject data);

// Content
void bookConstructor(REALobject self, RBBoolean xml);
void bookDestructor(REALobject self);
REALstring bookErrorMessage(REALobject self, RBInteger);
RBBoolean bookIsTemplate(REALobject self, RBInteger);
void bookSetIsTemplate(REALobject self, RBInteger, RBBoolean value);
RBBoolean bookIsDate1904(REALobject self, RBInteger);
void bookSetIsDate1904(REALobject self, RBInteger, RBBoolean value);
RBBoolean bookRgbMode(REALobject self, RBInteger);
void bookSetRgbMode(REALobject self, RBInteger, RBBoolean value);
RBInteger bookActiveSheet(REALobject self, RBInteger);
void bookSetActiveSheet(REALobject self, RBInteger, RBInteger value);
RBInteger bookRefR1C1(REALobject self, RBInteger);
void bookSetRefR1C1(REALobject self, RBInteger, RBInteger value);
RBInteger bookBiffVersion(REALobject self, RBInteger);
RBBoolean bookDebugging(RBInteger);
void bookSetDebugging(RBInteger, RBBoolean value);
RBBoolean bookMoveSheet(REALobject self, RBInteger source, RBInteger dest);
RBInteger bookSheetType(REALobject self, RBInteger index);
RBInteger bookVersion(REALobject self);
REALarray bookSheets(REALobject self);
REALarray bookFormats(REALobject self);
REALarray bookFonts(REALobject self);
REALobject bookInsertSheet(REALobject self, RBInteger index, REALstring name, REALobject initSheet);
REALobject bookAddSheet(REALobject self, REALstring name, REALobject initSheet);
REALobject bookSheet(REALobject self, RBInteger index);
RBInteger bookSheetCount(REALobject self);
RBBoolean bookDelSheet(REALobject self, RBInteger index);
void bookSetLocale(REALobject self, REALstring locale);
RBInteger bookAddCustomNumFormat(REALobject self, REALstring format);
REALstring bookCustomNumFormat(REALobject self, RBInteger format);
REALobject bookAddFormat(REALobject self, REALobject initFormat);
REALobject bookAddFont(REALobject self, REALobject initFont);
REALobject bookFont(REALobject self, RBInteger index);
RBInteger bookFontCount(REALobject self);
REALobject bookFormat(REALobject self, RBInteger index);
RBInteger bookFormatCount(REALobject self);
REALstring bookDefaultFont(REALobject self, RBInteger* fontSize);
void bookSetDefaultFont(REALobject self, REALstring fontName, RBInteger fontSize);
RBInteger bookAddPictureFolder(REALobject self, REALobject path);
RBInteger bookAddPictureString(REALobject self, REALstring path);
RBInteger bookAddPictureData(REALobject self, REALstring data);
RBInteger bookPicture(REALobject self, RBInteger index, REALstring* data);
RBInteger bookPictureCount(REALobject self);
double bookPackDateObject(REALobject self, REALobject date);
REALobject bookUnpackDateObject(REALobject self, double value);
double bookPackDate(REALobject self, RBInteger year, RBInteger month, RBInteger day, RBInteger hour, RBInteger minute,
                    RBInteger second, RBInteger msec);
RBBoolean bookUnpackDate7(REALobject self, double value, RBInteger* year, RBInteger* month, RBInteger* day,
                          RBInteger* hour, RBInteger* minute, RBInteger* second, RBInteger* msec);
RBBoolean bookUnpackDate6(REALobject self, double value, RBInteger* year, RBInteger* month, RBInteger* day,
                          RBInteger* hour, RBInteger* minute, RBInteger* second);
RBBoolean bookUnpackDate3(REALobject self, double value, RBInteger* year, RBInteger* month, RBInteger* day);
RBColor bookUnpackColorValue(REALobject self, RBInteger color);
void bookUnpackColor(REALobject self, RBInteger color, RBInteger* red, RBInteger* green, RBInteger* blue);
RBInteger bookPackColorValue(REALobject self, RBColor color);
RBInteger bookPackColor(REALobject self, RBInteger red, RBInteger green, RBInteger blue);

// Shared
RBBoolean bookLoadLibraryString(REALstring path);
RBBoolean bookLoadLibraryFolder(REALobject file);
REALstring bookLoadError();
RBBoolean bookAvailable();
REALobject bookLoad2String(REALstring path);
REALobject bookLoad2Folder(REALobject path);
REALobject bookLoadRaw2String(REALstring data);
REALobject bookLoadRaw2Block(REALobject data);
REALobject bookLoad2StringMessage(REALstring path, REALstring* message);
REALobject bookLoad2FolderMessage(REALobject path, REALstring* message);
REALobject bookLoadRaw2StringMessage(REALstring data, REALstring* message);
REALobject bookLoadRaw2BlockMessage(REALobject data, REALstring* message);
REALstring bookLibVersion();
RBInteger bookLibVersionNumber();

}  // namespace quire_plugin
