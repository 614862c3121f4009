/*
 * quire: reading and writing spreadsheet files (.xls and .xlsx).
 *
 * The flat C interface of the library. Every function takes an opaque handle first and
 * forwards to one operation of the book, sheet, format, font, autofilter or filter column
 * behind it. Conventions:
 *   - Booleans are int: 0 is false, any other value true (the few functions that count only
 *     positive values as true say so); results are 0 or 1.
 *   - Text is zero-terminated wide strings. Returned strings belong to the book and stay valid
 *     until the next call returning a string on the same book (or sheet); copy them.
 *     The error message alone is a narrow string.
 *   - Out-parameters may be null when the value is not wanted.
 *   - Handles are owned by their book and die with it in qrBookReleaseW. Functions do not
 *     check their handle: null or released handles are caller errors.
 *   - Failures never raise: a function returns 0, -1 or null and qrBookErrorMessageW tells why
 *     ("ok" after success).
 */
#ifndef QUIRE_H
#define QUIRE_H

#include <wchar.h>

#ifndef QUIRE_API
#if defined(__GNUC__) || defined(__clang__)
#define QUIRE_API __attribute__((visibility("default")))
#else
#define QUIRE_API
#endif
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Opaque handles: the addresses of the library's objects. */
typedef struct quire_book* BookHandle;
typedef struct quire_sheet* SheetHandle;
typedef struct quire_format* FormatHandle;
typedef struct quire_font* FontHandle;
typedef struct quire_auto_filter* AutoFilterHandle;
typedef struct quire_filter_column* FilterColumnHandle;

/* ---- Enumerations (passed as int) ---- */

enum Color {
    ColorBlack = 8, ColorWhite = 9, ColorRed = 10, ColorBrightgreen = 11, ColorBlue = 12,
    ColorYellow = 13, ColorPink = 14, ColorTurquoise = 15, ColorDarkred = 16, ColorGreen = 17,
    ColorDarkblue = 18, ColorDarkyellow = 19, ColorViolet = 20, ColorTeal = 21, ColorGray25 = 22,
    ColorGray50 = 23, ColorPeriwinkleCf = 24, ColorPlumCf = 25, ColorIvoryCf = 26,
    ColorLightturquoiseCf = 27, ColorDarkpurpleCf = 28, ColorCoralCf = 29, ColorOceanblueCf = 30,
    ColorIceblueCf = 31, ColorDarkblueCl = 32, ColorPinkCl = 33, ColorYellowCl = 34,
    ColorTurquoiseCl = 35, ColorVioletCl = 36, ColorDarkredCl = 37, ColorTealCl = 38,
    ColorBlueCl = 39, ColorSkyblue = 40, ColorLightturquoise = 41, ColorLightgreen = 42,
    ColorLightyellow = 43, ColorPaleblue = 44, ColorRose = 45, ColorLavender = 46, ColorTan = 47,
    ColorLightblue = 48, ColorAqua = 49, ColorLime = 50, ColorGold = 51, ColorLightorange = 52,
    ColorOrange = 53, ColorBluegray = 54, ColorGray40 = 55, ColorDarkteal = 56, ColorSeagreen = 57,
    ColorDarkgreen = 58, ColorOlivegreen = 59, ColorBrown = 60, ColorPlum = 61, ColorIndigo = 62,
    ColorGray80 = 63,
    ColorDefaultForeground = 64, ColorDefaultBackground = 65, ColorTooltip = 81,
    ColorNone = 0x7F, ColorAuto = 0x7FFF
};

enum NumFormat {
    NumformatGeneral = 0, NumformatNumber = 1, NumformatNumberD2 = 2, NumformatNumberSep = 3,
    NumformatNumberSepD2 = 4, NumformatCurrencyNegbra = 5, NumformatCurrencyNegbraRed = 6,
    NumformatCurrencyD2Negbra = 7, NumformatCurrencyD2NegbraRed = 8, NumformatPercent = 9,
    NumformatPercentD2 = 10, NumformatScientificD2 = 11, NumformatFractionOneDig = 12,
    NumformatFractionTwoDig = 13, NumformatDate = 14, NumformatCustomDMonYY = 15,
    NumformatCustomDMon = 16, NumformatCustomMonYY = 17, NumformatCustomHMMAM = 18,
    NumformatCustomHMMSSAM = 19, NumformatCustomHMM = 20, NumformatCustomHMMSS = 21,
    NumformatCustomMDYYYYHMM = 22,
    NumformatNumberSepNegbra = 37, NumformatNumberSepNegbraRed = 38,
    NumformatNumberD2SepNegbra = 39, NumformatNumberD2SepNegbraRed = 40, NumformatAccount = 41,
    NumformatAccountcur = 42, NumformatAccountD2 = 43, NumformatAccountD2Cur = 44,
    NumformatCustoMMMSS = 45, NumformatCustomH0MMSS = 46, NumformatCustoMMMSS0 = 47,
    NumformatCustom000P0EPlus0 = 48, NumformatText = 49
};

enum AlignH {
    AlignHGeneral = 0, AlignHLeft = 1, AlignHCenter = 2, AlignHRight = 3, AlignHFill = 4,
    AlignHJustify = 5, AlignHMerge = 6, AlignHDistributed = 7
};

enum AlignV {
    AlignVTop = 0, AlignVCenter = 1, AlignVBottom = 2, AlignVJustify = 3, AlignVDistributed = 4
};

enum BorderStyle {
    BorderStyleNone = 0, BorderStyleThin = 1, BorderStyleMedium = 2, BorderStyleDashed = 3,
    BorderStyleDotted = 4, BorderStyleThick = 5, BorderStyleDouble = 6, BorderStyleHair = 7,
    BorderStyleMediumdashed = 8, BorderStyleDashdot = 9, BorderStyleMediumdashdot = 10,
    BorderStyleDashdotdot = 11, BorderStyleMediumdashdotdot = 12, BorderStyleSlantdashdot = 13
};

enum BorderDiagonal {
    BorderDiagonalNone = 0, BorderDiagonalDown = 1, BorderDiagonalUp = 2, BorderDiagonalBoth = 3
};

enum FillPattern {
    FillPatternNone = 0, FillPatternSolid = 1, FillPatternGray50 = 2, FillPatternGray75 = 3,
    FillPatternGray25 = 4, FillPatternHorstripe = 5, FillPatternVerstripe = 6,
    FillPatternRevdiagstripe = 7, FillPatternDiagstripe = 8, FillPatternDiagcrosshatch = 9,
    FillPatternThickdiagcrosshatch = 10, FillPatternThinhorstripe = 11,
    FillPatternThinverstripe = 12, FillPatternThinrevdiagstripe = 13,
    FillPatternThindiagstripe = 14, FillPatternThinhorcrosshatch = 15,
    FillPatternThindiagcrosshatch = 16, FillPatternGray12P5 = 17, FillPatternGray6P25 = 18
};

enum Underline {
    UnderlineNone = 0, UnderlineSingle = 1, UnderlineDouble = 2, UnderlineSingleacc = 0x21,
    UnderlineDoubleacc = 0x22
};

enum Script { ScriptNormal = 0, ScriptSuper = 1, ScriptSub = 2 };

enum CellType {
    CellTypeEmpty = 0, CellTypeNumber = 1, CellTypeString = 2, CellTypeBoolean = 3,
    CellTypeBlank = 4, CellTypeError = 5
};

enum ErrorType {
    ErrorTypeNull = 0x00, ErrorTypeDiv0 = 0x07, ErrorTypeValue = 0x0F, ErrorTypeRef = 0x17,
    ErrorTypeName = 0x1D, ErrorTypeNum = 0x24, ErrorTypeNA = 0x2A, ErrorTypeNoError = 0xFF
};

enum SheetType { SheetTypeSheet = 0, SheetTypeChart = 1, SheetTypeUnknown = 2 };

enum SheetState { SheetStateVisible = 0, SheetStateHidden = 1, SheetStateVeryHidden = 2 };

/* Scope of a defined name; values from 0 are sheet indexes. */
enum Scope { ScopeWorkbook = -1, ScopeUndefined = -2 };

enum PictureType {
    PictureTypePNG = 0, PictureTypeJPEG = 1, PictureTypeGIF = 2, PictureTypeWMF = 3,
    PictureTypeDIB = 4, PictureTypeEMF = 5, PictureTypePICT = 6, PictureTypeTIFF = 7,
    PictureTypeError = 0xFF
};

/* Printer paper-size codes; 48 and 49 have no name. */
enum Paper {
    PaperDefault = 0, PaperLetter = 1, PaperLetterSmall = 2, PaperTabloid = 3, PaperLedger = 4,
    PaperLegal = 5, PaperStatement = 6, PaperExecutive = 7, PaperA3 = 8, PaperA4 = 9,
    PaperA4Small = 10, PaperA5 = 11, PaperB4 = 12, PaperB5 = 13, PaperFolio = 14,
    PaperQuatro = 15, Paper10X14 = 16, Paper10X17 = 17, PaperNote = 18, PaperEnvelope9 = 19,
    PaperEnvelope10 = 20, PaperEnvelope11 = 21, PaperEnvelope12 = 22, PaperEnvelope14 = 23,
    PaperCSize = 24, PaperDSize = 25, PaperESize = 26, PaperEnvelopeDL = 27,
    PaperEnvelopeC5 = 28, PaperEnvelopeC3 = 29, PaperEnvelopeC4 = 30, PaperEnvelopeC6 = 31,
    PaperEnvelopeC65 = 32, PaperEnvelopeB4 = 33, PaperEnvelopeB5 = 34, PaperEnvelopeB6 = 35,
    PaperEnvelope = 36, PaperEnvelopeMonarch = 37, PaperUSEnvelope = 38, PaperFanfold = 39,
    PaperGermanStdFanfold = 40, PaperGermanLegalFanfold = 41, PaperB4Iso = 42,
    PaperJapanesePostcard = 43, Paper9X11 = 44, Paper10X11 = 45, Paper15X11 = 46,
    PaperEnvelopeInvite = 47,
    PaperUSLetterExtra = 50, PaperUSLegalExtra = 51, PaperUSTabloidExtra = 52,
    PaperA4Extra = 53, PaperLetterTransverse = 54, PaperA4Transverse = 55,
    PaperLetterExtraTransverse = 56, PaperSupera = 57, PaperSuperb = 58,
    PaperUSLetterPlus = 59, PaperA4Plus = 60, PaperA5Transverse = 61, PaperB5Transverse = 62,
    PaperA3Extra = 63, PaperA5Extra = 64, PaperB5Extra = 65, PaperA2 = 66,
    PaperA3Transverse = 67, PaperA3ExtraTransverse = 68, PaperJapaneseDoublePostcard = 69,
    PaperA6 = 70, PaperJapaneseEnvelopeKaku2 = 71, PaperJapaneseEnvelopeKaku3 = 72,
    PaperJapaneseEnvelopeChou3 = 73, PaperJapaneseEnvelopeChou4 = 74, PaperLetterRotated = 75,
    PaperA3Rotated = 76, PaperA4Rotated = 77, PaperA5Rotated = 78, PaperB4Rotated = 79,
    PaperB5Rotated = 80, PaperJapanesePostcardRotated = 81,
    PaperDoubleJapanesePostcardRotated = 82, PaperA6Rotated = 83,
    PaperJapaneseEnvelopeKaku2Rotated = 84, PaperJapaneseEnvelopeKaku3Rotated = 85,
    PaperJapaneseEnvelopeChou3Rotated = 86, PaperJapaneseEnvelopeChou4Rotated = 87,
    PaperB6 = 88, PaperB6Rotated = 89, Paper12X11 = 90, PaperJapaneseEnvelopeYou4 = 91,
    PaperJapaneseEnvelopeYou4Rotated = 92, PaperPrc16K = 93, PaperPrc32K = 94,
    PaperPrc32KBig = 95, PaperPrcEnvelope1 = 96, PaperPrcEnvelope2 = 97,
    PaperPrcEnvelope3 = 98, PaperPrcEnvelope4 = 99, PaperPrcEnvelope5 = 100,
    PaperPrcEnvelope6 = 101, PaperPrcEnvelope7 = 102, PaperPrcEnvelope8 = 103,
    PaperPrcEnvelope9 = 104, PaperPrcEnvelope10 = 105, PaperPrc16KRotated = 106,
    PaperPrc32KRotated = 107, PaperPrc32KbigRotated = 108, PaperPrcEnvelope1Rotated = 109,
    PaperPrcEnvelope2Rotated = 110, PaperPrcEnvelope3Rotated = 111,
    PaperPrcEnvelope4Rotated = 112, PaperPrcEnvelope5Rotated = 113,
    PaperPrcEnvelope6Rotated = 114, PaperPrcEnvelope7Rotated = 115,
    PaperPrcEnvelope8Rotated = 116, PaperPrcEnvelope9Rotated = 117,
    PaperPrcEnvelope10Rotated = 118
};

/* Bit flags for qrSheetAddIgnoredErrorW. */
enum IgnoredError {
    IgnoreErrorNoError = 0, IgnoreErrorEvalError = 1, IgnoreErrorEmptyCellref = 2,
    IgnoreErrorNumberStoredAsText = 4, IgnoreErrorInconsistRange = 8,
    IgnoreErrorInconsistFormula = 16, IgnoreErrorTwodigTextyear = 32,
    IgnoreErrorUnlockFormula = 64, IgnoreErrorDataValidation = 128
};

/* Bit flags for qrSheetSetProtectExW. */
enum EnhancedProtection {
    ProtectDefault = -1, ProtectAll = 0, ProtectObjects = 1, ProtectScenarios = 2,
    ProtectFormatCells = 4, ProtectFormatColumns = 8, ProtectFormatRows = 16,
    ProtectInsertColumns = 32, ProtectInsertRows = 64, ProtectInsertHyperlinks = 128,
    ProtectDeleteColumns = 256, ProtectDeleteRows = 512, ProtectSelLockedCells = 1024,
    ProtectSort = 2048, ProtectAutofilter = 4096, ProtectPivottables = 8192,
    ProtectSelUnlockedCells = 16384
};

enum DataValidationType {
    ValidationTypeNone = 0, ValidationTypeWhole = 1, ValidationTypeDecimal = 2,
    ValidationTypeList = 3, ValidationTypeDate = 4, ValidationTypeTime = 5,
    ValidationTypeTextlength = 6, ValidationTypeCustom = 7
};

enum DataValidationOperator {
    ValidationOpBetween = 0, ValidationOpNotbetween = 1, ValidationOpEqual = 2,
    ValidationOpNotequal = 3, ValidationOpLessthan = 4, ValidationOpLessthanorequal = 5,
    ValidationOpGreaterthan = 6, ValidationOpGreaterthanorequal = 7
};

enum DataValidationErrorStyle {
    ValidationErrstyleStop = 0, ValidationErrstyleWarning = 1, ValidationErrstyleInformation = 2
};

enum FilterType {
    FilterValue = 0, FilterTop10 = 1, FilterCustom = 2, FilterDynamic = 3, FilterColor = 4,
    FilterIcon = 5, FilterExt = 6, FilterNotSet = 7
};

enum Operator {
    OperatorEqual = 0, OperatorGreaterThan = 1, OperatorGreaterThanOrEqual = 2,
    OperatorLessThan = 3, OperatorLessThanOrEqual = 4, OperatorNotEqual = 5
};

/* ---- Factories ---- */

/* A new empty binary (.xls) book; null when memory cannot be obtained. */
QUIRE_API BookHandle qrCreateBookCW(void);
/* A new empty Open XML (.xlsx) book; null when memory cannot be obtained. */
QUIRE_API BookHandle qrCreateXMLBookCW(void);

/* ---- Book ---- */

QUIRE_API int qrBookLoadUsingTempFileW(BookHandle book, const wchar_t* fileName,
                                       const wchar_t* tempFile);
QUIRE_API int qrBookLoadW(BookHandle book, const wchar_t* fileName);
QUIRE_API int qrBookLoadPartiallyUsingTempFileW(BookHandle book, const wchar_t* fileName,
                                                int sheetIndex, int firstRow, int lastRow,
                                                const wchar_t* tempFile);
QUIRE_API int qrBookLoadPartiallyW(BookHandle book, const wchar_t* fileName, int sheetIndex,
                                   int firstRow, int lastRow);
QUIRE_API int qrBookSaveUsingTempFileW(BookHandle book, const wchar_t* fileName, int useTempFile);
QUIRE_API int qrBookSaveW(BookHandle book, const wchar_t* fileName);
QUIRE_API int qrBookLoadRawPartiallyW(BookHandle book, const char* data, unsigned size,
                                      int sheetIndex, int firstRow, int lastRow);
QUIRE_API int qrBookLoadRawW(BookHandle book, const char* data, unsigned size);
/* The buffer belongs to the book and stays valid until the next save or the release. */
QUIRE_API int qrBookSaveRawW(BookHandle book, const char** data, unsigned* size);
QUIRE_API SheetHandle qrBookAddSheetW(BookHandle book, const wchar_t* name, SheetHandle initSheet);
QUIRE_API SheetHandle qrBookInsertSheetW(BookHandle book, int index, const wchar_t* name,
                                         SheetHandle initSheet);
QUIRE_API SheetHandle qrBookGetSheetW(BookHandle book, int index);
QUIRE_API int qrBookSheetTypeW(BookHandle book, int index);
QUIRE_API int qrBookMoveSheetW(BookHandle book, int srcIndex, int dstIndex);
QUIRE_API int qrBookDelSheetW(BookHandle book, int index);
QUIRE_API int qrBookSheetCountW(BookHandle book);
QUIRE_API FormatHandle qrBookAddFormatW(BookHandle book, FormatHandle initFormat);
QUIRE_API FontHandle qrBookAddFontW(BookHandle book, FontHandle initFont);
QUIRE_API int qrBookAddCustomNumFormatW(BookHandle book, const wchar_t* customNumFormat);
QUIRE_API const wchar_t* qrBookCustomNumFormatW(BookHandle book, int fmt);
QUIRE_API FormatHandle qrBookFormatW(BookHandle book, int index);
QUIRE_API int qrBookFormatSizeW(BookHandle book);
QUIRE_API FontHandle qrBookFontW(BookHandle book, int index);
QUIRE_API int qrBookFontSizeW(BookHandle book);
QUIRE_API double qrBookDatePackW(BookHandle book, int year, int month, int day, int hour, int min,
                                 int sec, int msec);
QUIRE_API int qrBookDateUnpackW(BookHandle book, double value, int* year, int* month, int* day,
                                int* hour, int* min, int* sec, int* msec);
QUIRE_API int qrBookColorPackW(BookHandle book, int red, int green, int blue);
QUIRE_API void qrBookColorUnpackW(BookHandle book, int color, int* red, int* green, int* blue);
QUIRE_API int qrBookActiveSheetW(BookHandle book);
QUIRE_API void qrBookSetActiveSheetW(BookHandle book, int index);
QUIRE_API int qrBookPictureSizeW(BookHandle book);
QUIRE_API int qrBookGetPictureW(BookHandle book, int index, const char** data, unsigned* size);
QUIRE_API int qrBookAddPictureW(BookHandle book, const wchar_t* fileName);
QUIRE_API int qrBookAddPicture2W(BookHandle book, const char* data, unsigned size);
QUIRE_API const wchar_t* qrBookDefaultFontW(BookHandle book, int* fontSize);
QUIRE_API void qrBookSetDefaultFontW(BookHandle book, const wchar_t* fontName, int fontSize);
QUIRE_API int qrBookRefR1C1W(BookHandle book);
QUIRE_API void qrBookSetRefR1C1W(BookHandle book, int refR1C1);
QUIRE_API int qrBookRgbModeW(BookHandle book);
QUIRE_API void qrBookSetRgbModeW(BookHandle book, int rgbMode);
QUIRE_API int qrBookVersionW(BookHandle book);
QUIRE_API int qrBookBiffVersionW(BookHandle book);
QUIRE_API int qrBookIsDate1904W(BookHandle book);
QUIRE_API void qrBookSetDate1904W(BookHandle book, int date1904);
QUIRE_API int qrBookIsTemplateW(BookHandle book);
QUIRE_API void qrBookSetTemplateW(BookHandle book, int tmpl);
QUIRE_API int qrBookSetLocaleW(BookHandle book, const char* locale);
QUIRE_API const char* qrBookErrorMessageW(BookHandle book);
/* Destroys the book and everything obtained from it. */
QUIRE_API void qrBookReleaseW(BookHandle book);

/* ---- Sheet ---- */

/* Cells. The read functions return the cell's format through `format` when it is not null. */
QUIRE_API int qrSheetCellTypeW(SheetHandle sheet, int row, int col);
QUIRE_API int qrSheetIsFormulaW(SheetHandle sheet, int row, int col);
QUIRE_API FormatHandle qrSheetCellFormatW(SheetHandle sheet, int row, int col);
QUIRE_API void qrSheetSetCellFormatW(SheetHandle sheet, int row, int col, FormatHandle format);
QUIRE_API const wchar_t* qrSheetReadStrW(SheetHandle sheet, int row, int col, FormatHandle* format);
QUIRE_API int qrSheetWriteStrW(SheetHandle sheet, int row, int col, const wchar_t* value,
                               FormatHandle format);
QUIRE_API double qrSheetReadNumW(SheetHandle sheet, int row, int col, FormatHandle* format);
QUIRE_API int qrSheetWriteNumW(SheetHandle sheet, int row, int col, double value,
                               FormatHandle format);
QUIRE_API int qrSheetReadBoolW(SheetHandle sheet, int row, int col, FormatHandle* format);
QUIRE_API int qrSheetWriteBoolW(SheetHandle sheet, int row, int col, int value,
                                FormatHandle format);
/* `format` is required here: the format of a blank cell is all it has. */
QUIRE_API int qrSheetReadBlankW(SheetHandle sheet, int row, int col, FormatHandle* format);
QUIRE_API int qrSheetWriteBlankW(SheetHandle sheet, int row, int col, FormatHandle format);
QUIRE_API const wchar_t* qrSheetReadFormulaW(SheetHandle sheet, int row, int col,
                                             FormatHandle* format);
QUIRE_API int qrSheetWriteFormulaW(SheetHandle sheet, int row, int col, const wchar_t* expr,
                                   FormatHandle format);
QUIRE_API int qrSheetWriteFormulaNumW(SheetHandle sheet, int row, int col, const wchar_t* expr,
                                      double value, FormatHandle format);
QUIRE_API int qrSheetWriteFormulaStrW(SheetHandle sheet, int row, int col, const wchar_t* expr,
                                      const wchar_t* value, FormatHandle format);
QUIRE_API int qrSheetWriteFormulaBoolW(SheetHandle sheet, int row, int col, const wchar_t* expr,
                                       int value, FormatHandle format);
QUIRE_API const wchar_t* qrSheetReadCommentW(SheetHandle sheet, int row, int col);
QUIRE_API void qrSheetWriteCommentW(SheetHandle sheet, int row, int col, const wchar_t* value,
                                    const wchar_t* author, int width, int height);
QUIRE_API void qrSheetRemoveCommentW(SheetHandle sheet, int row, int col);
QUIRE_API int qrSheetIsDateW(SheetHandle sheet, int row, int col);
QUIRE_API int qrSheetReadErrorW(SheetHandle sheet, int row, int col);
QUIRE_API void qrSheetWriteErrorW(SheetHandle sheet, int row, int col, int error,
                                  FormatHandle format);

/* Rows and columns */
QUIRE_API double qrSheetColWidthW(SheetHandle sheet, int col);
QUIRE_API double qrSheetRowHeightW(SheetHandle sheet, int row);
QUIRE_API int qrSheetColWidthPxW(SheetHandle sheet, int col);
QUIRE_API int qrSheetRowHeightPxW(SheetHandle sheet, int row);
QUIRE_API int qrSheetSetColW(SheetHandle sheet, int colFirst, int colLast, double width,
                             FormatHandle format, int hidden);
QUIRE_API int qrSheetSetRowW(SheetHandle sheet, int row, double height, FormatHandle format,
                             int hidden);
QUIRE_API int qrSheetRowHiddenW(SheetHandle sheet, int row);
QUIRE_API int qrSheetSetRowHiddenW(SheetHandle sheet, int row, int hidden);
QUIRE_API int qrSheetColHiddenW(SheetHandle sheet, int col);
QUIRE_API int qrSheetSetColHiddenW(SheetHandle sheet, int col, int hidden);

/* Merged ranges */
QUIRE_API int qrSheetGetMergeW(SheetHandle sheet, int row, int col, int* rowFirst, int* rowLast,
                               int* colFirst, int* colLast);
QUIRE_API int qrSheetSetMergeW(SheetHandle sheet, int rowFirst, int rowLast, int colFirst,
                               int colLast);
QUIRE_API int qrSheetDelMergeW(SheetHandle sheet, int row, int col);
QUIRE_API int qrSheetMergeSizeW(SheetHandle sheet);
QUIRE_API int qrSheetMergeW(SheetHandle sheet, int index, int* rowFirst, int* rowLast,
                            int* colFirst, int* colLast);
QUIRE_API int qrSheetDelMergeByIndexW(SheetHandle sheet, int index);

/* Pictures */
QUIRE_API int qrSheetPictureSizeW(SheetHandle sheet);
QUIRE_API int qrSheetGetPictureW(SheetHandle sheet, int index, int* rowTop, int* colLeft,
                                 int* rowBottom, int* colRight, int* width, int* height,
                                 int* offset_x, int* offset_y);
QUIRE_API void qrSheetSetPictureW(SheetHandle sheet, int row, int col, int pictureId, double scale,
                                  int offset_x, int offset_y, int position);
QUIRE_API void qrSheetSetPicture2W(SheetHandle sheet, int row, int col, int pictureId, int width,
                                   int height, int offset_x, int offset_y, int position);

/* Page breaks, panes, outline */
QUIRE_API int qrSheetGetHorPageBreakW(SheetHandle sheet, int index);
QUIRE_API int qrSheetGetHorPageBreakSizeW(SheetHandle sheet);
QUIRE_API int qrSheetGetVerPageBreakW(SheetHandle sheet, int index);
QUIRE_API int qrSheetGetVerPageBreakSizeW(SheetHandle sheet);
QUIRE_API int qrSheetSetHorPageBreakW(SheetHandle sheet, int row, int pageBreak);
QUIRE_API int qrSheetSetVerPageBreakW(SheetHandle sheet, int col, int pageBreak);
QUIRE_API void qrSheetSplitW(SheetHandle sheet, int row, int col);
QUIRE_API int qrSheetSplitInfoW(SheetHandle sheet, int* row, int* col);
QUIRE_API int qrSheetGroupRowsW(SheetHandle sheet, int rowFirst, int rowLast, int collapsed);
QUIRE_API int qrSheetGroupColsW(SheetHandle sheet, int colFirst, int colLast, int collapsed);
QUIRE_API int qrSheetGroupSummaryBelowW(SheetHandle sheet);
QUIRE_API void qrSheetSetGroupSummaryBelowW(SheetHandle sheet, int below);
QUIRE_API int qrSheetGroupSummaryRightW(SheetHandle sheet);
QUIRE_API void qrSheetSetGroupSummaryRightW(SheetHandle sheet, int right);

/* Editing the grid */
QUIRE_API void qrSheetClearW(SheetHandle sheet, int rowFirst, int rowLast, int colFirst,
                             int colLast);
QUIRE_API int qrSheetInsertColW(SheetHandle sheet, int colFirst, int colLast);
QUIRE_API int qrSheetInsertRowW(SheetHandle sheet, int rowFirst, int rowLast);
QUIRE_API int qrSheetRemoveColW(SheetHandle sheet, int colFirst, int colLast);
QUIRE_API int qrSheetRemoveRowW(SheetHandle sheet, int rowFirst, int rowLast);
QUIRE_API int qrSheetCopyCellW(SheetHandle sheet, int rowSrc, int colSrc, int rowDst, int colDst);
QUIRE_API int qrSheetFirstRowW(SheetHandle sheet);
QUIRE_API int qrSheetLastRowW(SheetHandle sheet);
QUIRE_API int qrSheetFirstColW(SheetHandle sheet);
QUIRE_API int qrSheetLastColW(SheetHandle sheet);

/* View and print settings */
QUIRE_API int qrSheetDisplayGridlinesW(SheetHandle sheet);
QUIRE_API void qrSheetSetDisplayGridlinesW(SheetHandle sheet, int show);
QUIRE_API int qrSheetPrintGridlinesW(SheetHandle sheet);
QUIRE_API void qrSheetSetPrintGridlinesW(SheetHandle sheet, int print);
QUIRE_API int qrSheetZoomW(SheetHandle sheet);
QUIRE_API void qrSheetSetZoomW(SheetHandle sheet, int zoom);
QUIRE_API int qrSheetPrintZoomW(SheetHandle sheet);
QUIRE_API void qrSheetSetPrintZoomW(SheetHandle sheet, int zoom);
QUIRE_API int qrSheetGetPrintFitW(SheetHandle sheet, int* wPages, int* hPages);
QUIRE_API void qrSheetSetPrintFitW(SheetHandle sheet, int wPages, int hPages);
QUIRE_API int qrSheetLandscapeW(SheetHandle sheet);
QUIRE_API void qrSheetSetLandscapeW(SheetHandle sheet, int landscape);
QUIRE_API int qrSheetPaperW(SheetHandle sheet);
QUIRE_API void qrSheetSetPaperW(SheetHandle sheet, int paper);
QUIRE_API const wchar_t* qrSheetHeaderW(SheetHandle sheet);
QUIRE_API int qrSheetSetHeaderW(SheetHandle sheet, const wchar_t* header, double margin);
QUIRE_API double qrSheetHeaderMarginW(SheetHandle sheet);
QUIRE_API const wchar_t* qrSheetFooterW(SheetHandle sheet);
QUIRE_API int qrSheetSetFooterW(SheetHandle sheet, const wchar_t* footer, double margin);
QUIRE_API double qrSheetFooterMarginW(SheetHandle sheet);
QUIRE_API int qrSheetHCenterW(SheetHandle sheet);
QUIRE_API void qrSheetSetHCenterW(SheetHandle sheet, int hCenter);
QUIRE_API int qrSheetVCenterW(SheetHandle sheet);
QUIRE_API void qrSheetSetVCenterW(SheetHandle sheet, int vCenter);
QUIRE_API double qrSheetMarginLeftW(SheetHandle sheet);
QUIRE_API void qrSheetSetMarginLeftW(SheetHandle sheet, double margin);
QUIRE_API double qrSheetMarginRightW(SheetHandle sheet);
QUIRE_API void qrSheetSetMarginRightW(SheetHandle sheet, double margin);
QUIRE_API double qrSheetMarginTopW(SheetHandle sheet);
QUIRE_API void qrSheetSetMarginTopW(SheetHandle sheet, double margin);
QUIRE_API double qrSheetMarginBottomW(SheetHandle sheet);
QUIRE_API void qrSheetSetMarginBottomW(SheetHandle sheet, double margin);
QUIRE_API int qrSheetPrintRowColW(SheetHandle sheet);
QUIRE_API void qrSheetSetPrintRowColW(SheetHandle sheet, int print);
QUIRE_API int qrSheetPrintRepeatRowsW(SheetHandle sheet, int* rowFirst, int* rowLast);
QUIRE_API void qrSheetSetPrintRepeatRowsW(SheetHandle sheet, int rowFirst, int rowLast);
QUIRE_API int qrSheetPrintRepeatColsW(SheetHandle sheet, int* colFirst, int* colLast);
QUIRE_API void qrSheetSetPrintRepeatColsW(SheetHandle sheet, int colFirst, int colLast);
QUIRE_API int qrSheetPrintAreaW(SheetHandle sheet, int* rowFirst, int* rowLast, int* colFirst,
                                int* colLast);
QUIRE_API void qrSheetSetPrintAreaW(SheetHandle sheet, int rowFirst, int rowLast, int colFirst,
                                    int colLast);
QUIRE_API void qrSheetClearPrintRepeatsW(SheetHandle sheet);
QUIRE_API void qrSheetClearPrintAreaW(SheetHandle sheet);

/* Defined names, tables, hyperlinks, autofilter */
QUIRE_API int qrSheetGetNamedRangeW(SheetHandle sheet, const wchar_t* name, int* rowFirst,
                                    int* rowLast, int* colFirst, int* colLast, int scopeId,
                                    int* hidden);
/* Defines the name with scope 0. */
QUIRE_API int qrSheetSetNamedRangeW(SheetHandle sheet, const wchar_t* name, int rowFirst,
                                    int rowLast, int colFirst, int colLast);
QUIRE_API int qrSheetDelNamedRangeW(SheetHandle sheet, const wchar_t* name, int scopeId);
QUIRE_API int qrSheetNamedRangeSizeW(SheetHandle sheet);
QUIRE_API const wchar_t* qrSheetNamedRangeW(SheetHandle sheet, int index, int* rowFirst,
                                            int* rowLast, int* colFirst, int* colLast,
                                            int* scopeId, int* hidden);
QUIRE_API int qrSheetTableSizeW(SheetHandle sheet);
QUIRE_API const wchar_t* qrSheetTableW(SheetHandle sheet, int index, int* rowFirst, int* rowLast,
                                       int* colFirst, int* colLast, int* headerRowCount,
                                       int* totalsRowCount);
QUIRE_API int qrSheetHyperlinkSizeW(SheetHandle sheet);
QUIRE_API const wchar_t* qrSheetHyperlinkW(SheetHandle sheet, int index, int* rowFirst,
                                           int* rowLast, int* colFirst, int* colLast);
QUIRE_API int qrSheetDelHyperlinkW(SheetHandle sheet, int index);
QUIRE_API void qrSheetAddHyperlinkW(SheetHandle sheet, const wchar_t* hyperlink, int rowFirst,
                                    int rowLast, int colFirst, int colLast);
/* Null for binary sheets, which have no autofilter. */
QUIRE_API AutoFilterHandle qrSheetAutoFilterW(SheetHandle sheet);
QUIRE_API void qrSheetApplyFilterW(SheetHandle sheet);
QUIRE_API void qrSheetRemoveFilterW(SheetHandle sheet);

/* Name, protection, visibility, view */
QUIRE_API const wchar_t* qrSheetNameW(SheetHandle sheet);
QUIRE_API void qrSheetSetNameW(SheetHandle sheet, const wchar_t* name);
QUIRE_API int qrSheetProtectW(SheetHandle sheet);
QUIRE_API void qrSheetSetProtectExW(SheetHandle sheet, int protect, const wchar_t* password,
                                    int enhancedProtection);
/* No password; every protection option (ProtectDefault). */
QUIRE_API void qrSheetSetProtectW(SheetHandle sheet, int protect);
QUIRE_API int qrSheetHiddenW(SheetHandle sheet);
QUIRE_API int qrSheetSetHiddenW(SheetHandle sheet, int state);
QUIRE_API void qrSheetGetTopLeftViewW(SheetHandle sheet, int* row, int* col);
QUIRE_API void qrSheetSetTopLeftViewW(SheetHandle sheet, int row, int col);
QUIRE_API int qrSheetRightToLeftW(SheetHandle sheet);
QUIRE_API void qrSheetSetRightToLeftW(SheetHandle sheet, int rightToLeft);
QUIRE_API void qrSheetSetAutoFitAreaW(SheetHandle sheet, int rowFirst, int colFirst, int rowLast,
                                      int colLast);
QUIRE_API void qrSheetAddrToRowColW(SheetHandle sheet, const wchar_t* addr, int* row, int* col,
                                    int* rowRelative, int* colRelative);
/* Only a positive rowRelative / colRelative means relative; 0 and negative give `$`. */
QUIRE_API const wchar_t* qrSheetRowColToAddrW(SheetHandle sheet, int row, int col,
                                              int rowRelative, int colRelative);
QUIRE_API void qrSheetSetTabRgbColorW(SheetHandle sheet, int red, int green, int blue);
QUIRE_API void qrSheetSetTabColorW(SheetHandle sheet, int color);
QUIRE_API int qrSheetAddIgnoredErrorW(SheetHandle sheet, int rowFirst, int colFirst, int rowLast,
                                      int colLast, int iError);
/* The four option flags count as true only when positive. */
QUIRE_API void qrSheetAddDataValidationExW(SheetHandle sheet, int type, int op, int rowFirst,
                                           int rowLast, int colFirst, int colLast,
                                           const wchar_t* value1, const wchar_t* value2,
                                           int allowBlank, int hideDropDown,
                                           int showInputMessage, int showErrorMessage,
                                           const wchar_t* promptTitle, const wchar_t* prompt,
                                           const wchar_t* errorTitle, const wchar_t* error,
                                           int errorStyle);
/* Allows blanks, shows the drop-down and both messages (without texts), stop style. */
QUIRE_API void qrSheetAddDataValidationW(SheetHandle sheet, int type, int op, int rowFirst,
                                         int rowLast, int colFirst, int colLast,
                                         const wchar_t* value1, const wchar_t* value2);
QUIRE_API void qrSheetAddDataValidationDoubleExW(SheetHandle sheet, int type, int op,
                                                 int rowFirst, int rowLast, int colFirst,
                                                 int colLast, double value1, double value2,
                                                 int allowBlank, int hideDropDown,
                                                 int showInputMessage, int showErrorMessage,
                                                 const wchar_t* promptTitle,
                                                 const wchar_t* prompt,
                                                 const wchar_t* errorTitle,
                                                 const wchar_t* error, int errorStyle);
QUIRE_API void qrSheetAddDataValidationDoubleW(SheetHandle sheet, int type, int op, int rowFirst,
                                               int rowLast, int colFirst, int colLast,
                                               double value1, double value2);
QUIRE_API void qrSheetRemoveDataValidationsW(SheetHandle sheet);

/* ---- Format ---- */

QUIRE_API FontHandle qrFormatFontW(FormatHandle format);
QUIRE_API int qrFormatSetFontW(FormatHandle format, FontHandle font);
QUIRE_API int qrFormatNumFormatW(FormatHandle format);
QUIRE_API void qrFormatSetNumFormatW(FormatHandle format, int numFormat);
QUIRE_API int qrFormatAlignHW(FormatHandle format);
QUIRE_API void qrFormatSetAlignHW(FormatHandle format, int align);
QUIRE_API int qrFormatAlignVW(FormatHandle format);
QUIRE_API void qrFormatSetAlignVW(FormatHandle format, int align);
QUIRE_API int qrFormatWrapW(FormatHandle format);
QUIRE_API void qrFormatSetWrapW(FormatHandle format, int wrap);
QUIRE_API int qrFormatRotationW(FormatHandle format);
QUIRE_API int qrFormatSetRotationW(FormatHandle format, int rotation);
QUIRE_API int qrFormatIndentW(FormatHandle format);
QUIRE_API void qrFormatSetIndentW(FormatHandle format, int indent);
QUIRE_API int qrFormatShrinkToFitW(FormatHandle format);
QUIRE_API void qrFormatSetShrinkToFitW(FormatHandle format, int shrinkToFit);
QUIRE_API void qrFormatSetBorderW(FormatHandle format, int style);
QUIRE_API void qrFormatSetBorderColorW(FormatHandle format, int color);
QUIRE_API int qrFormatBorderLeftW(FormatHandle format);
QUIRE_API void qrFormatSetBorderLeftW(FormatHandle format, int style);
QUIRE_API int qrFormatBorderRightW(FormatHandle format);
QUIRE_API void qrFormatSetBorderRightW(FormatHandle format, int style);
QUIRE_API int qrFormatBorderTopW(FormatHandle format);
QUIRE_API void qrFormatSetBorderTopW(FormatHandle format, int style);
QUIRE_API int qrFormatBorderBottomW(FormatHandle format);
QUIRE_API void qrFormatSetBorderBottomW(FormatHandle format, int style);
QUIRE_API int qrFormatBorderLeftColorW(FormatHandle format);
QUIRE_API void qrFormatSetBorderLeftColorW(FormatHandle format, int color);
QUIRE_API int qrFormatBorderRightColorW(FormatHandle format);
QUIRE_API void qrFormatSetBorderRightColorW(FormatHandle format, int color);
QUIRE_API int qrFormatBorderTopColorW(FormatHandle format);
QUIRE_API void qrFormatSetBorderTopColorW(FormatHandle format, int color);
QUIRE_API int qrFormatBorderBottomColorW(FormatHandle format);
QUIRE_API void qrFormatSetBorderBottomColorW(FormatHandle format, int color);
QUIRE_API int qrFormatBorderDiagonalW(FormatHandle format);
QUIRE_API void qrFormatSetBorderDiagonalW(FormatHandle format, int border);
QUIRE_API int qrFormatBorderDiagonalStyleW(FormatHandle format);
QUIRE_API void qrFormatSetBorderDiagonalStyleW(FormatHandle format, int style);
QUIRE_API int qrFormatBorderDiagonalColorW(FormatHandle format);
QUIRE_API void qrFormatSetBorderDiagonalColorW(FormatHandle format, int color);
QUIRE_API int qrFormatFillPatternW(FormatHandle format);
QUIRE_API void qrFormatSetFillPatternW(FormatHandle format, int pattern);
QUIRE_API int qrFormatPatternForegroundColorW(FormatHandle format);
QUIRE_API void qrFormatSetPatternForegroundColorW(FormatHandle format, int color);
QUIRE_API int qrFormatPatternBackgroundColorW(FormatHandle format);
QUIRE_API void qrFormatSetPatternBackgroundColorW(FormatHandle format, int color);
QUIRE_API int qrFormatLockedW(FormatHandle format);
QUIRE_API void qrFormatSetLockedW(FormatHandle format, int locked);
QUIRE_API int qrFormatHiddenW(FormatHandle format);
QUIRE_API void qrFormatSetHiddenW(FormatHandle format, int hidden);

/* ---- Font ---- */

QUIRE_API int qrFontSizeW(FontHandle font);
QUIRE_API void qrFontSetSizeW(FontHandle font, int size);
QUIRE_API int qrFontItalicW(FontHandle font);
QUIRE_API void qrFontSetItalicW(FontHandle font, int italic);
QUIRE_API int qrFontStrikeOutW(FontHandle font);
QUIRE_API void qrFontSetStrikeOutW(FontHandle font, int strikeOut);
QUIRE_API int qrFontColorW(FontHandle font);
QUIRE_API void qrFontSetColorW(FontHandle font, int color);
QUIRE_API int qrFontBoldW(FontHandle font);
QUIRE_API void qrFontSetBoldW(FontHandle font, int bold);
QUIRE_API int qrFontScriptW(FontHandle font);
QUIRE_API void qrFontSetScriptW(FontHandle font, int script);
QUIRE_API int qrFontUnderlineW(FontHandle font);
QUIRE_API void qrFontSetUnderlineW(FontHandle font, int underline);
QUIRE_API const wchar_t* qrFontNameW(FontHandle font);
QUIRE_API int qrFontSetNameW(FontHandle font, const wchar_t* name);

/* ---- AutoFilter ---- */

QUIRE_API int qrAutoFilterGetRefW(AutoFilterHandle autoFilter, int* rowFirst, int* rowLast,
                                  int* colFirst, int* colLast);
QUIRE_API void qrAutoFilterSetRefW(AutoFilterHandle autoFilter, int rowFirst, int rowLast,
                                   int colFirst, int colLast);
QUIRE_API FilterColumnHandle qrAutoFilterColumnW(AutoFilterHandle autoFilter, int colId);
QUIRE_API int qrAutoFilterColumnSizeW(AutoFilterHandle autoFilter);
QUIRE_API FilterColumnHandle qrAutoFilterColumnByIndexW(AutoFilterHandle autoFilter, int index);
QUIRE_API int qrAutoFilterGetSortRangeW(AutoFilterHandle autoFilter, int* rowFirst, int* rowLast,
                                        int* colFirst, int* colLast);
QUIRE_API int qrAutoFilterGetSortW(AutoFilterHandle autoFilter, int* columnIndex,
                                   int* descending);
QUIRE_API int qrAutoFilterSetSortW(AutoFilterHandle autoFilter, int columnIndex, int descending);

/* ---- FilterColumn ---- */

QUIRE_API int qrFilterColumnIndexW(FilterColumnHandle filterColumn);
QUIRE_API int qrFilterColumnFilterTypeW(FilterColumnHandle filterColumn);
QUIRE_API int qrFilterColumnFilterSizeW(FilterColumnHandle filterColumn);
QUIRE_API const wchar_t* qrFilterColumnFilterW(FilterColumnHandle filterColumn, int index);
QUIRE_API void qrFilterColumnAddFilterW(FilterColumnHandle filterColumn, const wchar_t* value);
QUIRE_API int qrFilterColumnGetTop10W(FilterColumnHandle filterColumn, double* value, int* top,
                                      int* percent);
QUIRE_API void qrFilterColumnSetTop10W(FilterColumnHandle filterColumn, double value, int top,
                                       int percent);
QUIRE_API int qrFilterColumnGetCustomFilterW(FilterColumnHandle filterColumn, int* op1,
                                             const wchar_t** value1, int* op2,
                                             const wchar_t** value2, int* andOp);
QUIRE_API void qrFilterColumnSetCustomFilterExW(FilterColumnHandle filterColumn, int op1,
                                                const wchar_t* value1, int op2,
                                                const wchar_t* value2, int andOp);
/* One condition: `op1` against `value1`. */
QUIRE_API void qrFilterColumnSetCustomFilterW(FilterColumnHandle filterColumn, int op1,
                                              const wchar_t* value1);
QUIRE_API void qrFilterColumnClearW(FilterColumnHandle filterColumn);

#ifdef __cplusplus
}
#endif

#endif /* QUIRE_H */
