#pragma once
// Integer constants that cross the flat entry points and the host classes.

namespace quire {

enum Color {
    ColorBlack = 8, ColorWhite, ColorRed, ColorBrightgreen, ColorBlue, ColorYellow, ColorPink,
    ColorTurquoise, ColorDarkred, ColorGreen, ColorDarkblue, ColorDarkyellow, ColorViolet, ColorTeal,
    ColorGray25, ColorGray50, ColorPeriwinkleCf, ColorPlumCf, ColorIvoryCf, ColorLightturquoiseCf,
    ColorDarkpurpleCf, ColorCoralCf, ColorOceanblueCf, ColorIceblueCf, ColorDarkblueCl, ColorPinkCl,
    ColorYellowCl, ColorTurquoiseCl, ColorVioletCl, ColorDarkredCl, ColorTealCl, ColorBlueCl,
    ColorSkyblue, ColorLightturquoise, ColorLightgreen, ColorLightyellow, ColorPaleblue, ColorRose,
    ColorLavender, ColorTan, ColorLightblue, ColorAqua, ColorLime, ColorGold, ColorLightorange,
    ColorOrange, ColorBluegray, ColorGray40, ColorDarkteal, ColorSeagreen, ColorDarkgreen,
    ColorOlivegreen, ColorBrown, ColorPlum, ColorIndigo, ColorGray80,
    ColorDefaultForeground = 64, ColorDefaultBackground = 65, ColorTooltip = 81,
    ColorNone = 0x7F, ColorAuto = 0x7FFF
};

enum NumFormat {
    NumformatGeneral = 0, NumformatNumber, NumformatNumberD2, NumformatNumberSep,
    NumformatNumberSepD2, NumformatCurrencyNegbra, NumformatCurrencyNegbraRed,
    NumformatCurrencyD2Negbra, NumformatCurrencyD2NegbraRed, NumformatPercent, NumformatPercentD2,
    NumformatScientificD2, NumformatFractionOneDig, NumformatFractionTwoDig, NumformatDate,
    NumformatCustomDMonYY, NumformatCustomDMon, NumformatCustomMonYY, NumformatCustomHMMAM,
    NumformatCustomHMMSSAM, NumformatCustomHMM, NumformatCustomHMMSS, NumformatCustomMDYYYYHMM,
    NumformatNumberSepNegbra = 37, NumformatNumberSepNegbraRed, NumformatNumberD2SepNegbra,
    NumformatNumberD2SepNegbraRed, NumformatAccount, NumformatAccountcur, NumformatAccountD2,
    NumformatAccountD2Cur, NumformatCustoMMMSS, NumformatCustomH0MMSS, NumformatCustoMMMSS0,
    NumformatCustom000P0EPlus0, NumformatText
};

enum AlignH {
    AlignHGeneral, AlignHLeft, AlignHCenter, AlignHRight, AlignHFill, AlignHJustify, AlignHMerge,
    AlignHDistributed
};

enum AlignV { AlignVTop, AlignVCenter, AlignVBottom, AlignVJustify, AlignVDistributed };

enum BorderStyle {
    BorderStyleNone, BorderStyleThin, BorderStyleMedium, BorderStyleDashed, BorderStyleDotted,
    BorderStyleThick, BorderStyleDouble, BorderStyleHair, BorderStyleMediumdashed,
    BorderStyleDashdot, BorderStyleMediumdashdot, BorderStyleDashdotdot,
    BorderStyleMediumdashdotdot, BorderStyleSlantdashdot
};

enum BorderDiagonal { BorderDiagonalNone, BorderDiagonalDown, BorderDiagonalUp, BorderDiagonalBoth };

enum FillPattern {
    FillPatternNone, FillPatternSolid, FillPatternGray50, FillPatternGray75, FillPatternGray25,
    FillPatternHorstripe, FillPatternVerstripe, FillPatternRevdiagstripe, FillPatternDiagstripe,
    FillPatternDiagcrosshatch, FillPatternThickdiagcrosshatch, FillPatternThinhorstripe,
    FillPatternThinverstripe, FillPatternThinrevdiagstripe, FillPatternThindiagstripe,
    FillPatternThinhorcrosshatch, FillPatternThindiagcrosshatch, FillPatternGray12P5,
    FillPatternGray6P25
};

enum Underline {
    UnderlineNone = 0, UnderlineSingle = 1, UnderlineDouble = 2, UnderlineSingleacc = 0x21,
    UnderlineDoubleacc = 0x22
};

enum Script { ScriptNormal, ScriptSuper, ScriptSub };

enum CellType {
    CellTypeEmpty, CellTypeNumber, CellTypeString, CellTypeBoolean, CellTypeBlank, CellTypeError
};

enum ErrorType {
    ErrorTypeNull = 0x00, ErrorTypeDiv0 = 0x07, ErrorTypeValue = 0x0F, ErrorTypeRef = 0x17,
    ErrorTypeName = 0x1D, ErrorTypeNum = 0x24, ErrorTypeNA = 0x2A, ErrorTypeNoError = 0xFF
};

enum SheetType { SheetTypeSheet, SheetTypeChart, SheetTypeUnknown };

enum SheetState { SheetStateVisible, SheetStateHidden, SheetStateVeryHidden };

enum Scope { ScopeWorkbook = -1, ScopeUndefined = -2 };

enum PictureType {
    PictureTypePNG, PictureTypeJPEG, PictureTypeGIF, PictureTypeWMF, PictureTypeDIB,
    PictureTypeEMF, PictureTypePICT, PictureTypeTIFF, PictureTypeError = 0xFF
};

enum Paper {
    PaperDefault, PaperLetter, PaperLetterSmall, PaperTabloid, PaperLedger, PaperLegal,
    PaperStatement, PaperExecutive, PaperA3, PaperA4, PaperA4Small, PaperA5, PaperB4, PaperB5,
    PaperFolio, PaperQuatro, Paper10X14, Paper10X17, PaperNote, PaperEnvelope9, PaperEnvelope10,
    PaperEnvelope11, PaperEnvelope12, PaperEnvelope14, PaperCSize, PaperDSize, PaperESize,
    PaperEnvelopeDL, PaperEnvelopeC5, PaperEnvelopeC3, PaperEnvelopeC4, PaperEnvelopeC6,
    PaperEnvelopeC65, PaperEnvelopeB4, PaperEnvelopeB5, PaperEnvelopeB6, PaperEnvelope,
    PaperEnvelopeMonarch, PaperUSEnvelope, PaperFanfold, PaperGermanStdFanfold,
    PaperGermanLegalFanfold, PaperB4Iso, PaperJapanesePostcard, Paper9X11, Paper10X11, Paper15X11,
    PaperEnvelopeInvite,
    PaperUSLetterExtra = 50, PaperUSLegalExtra, PaperUSTabloidExtra, PaperA4Extra,
    PaperLetterTransverse, PaperA4Transverse, PaperLetterExtraTransverse, PaperSupera, PaperSuperb,
    PaperUSLetterPlus, PaperA4Plus, PaperA5Transverse, PaperB5Transverse, PaperA3Extra,
    PaperA5Extra, PaperB5Extra, PaperA2, PaperA3Transverse, PaperA3ExtraTransverse,
    PaperJapaneseDoublePostcard, PaperA6, PaperJapaneseEnvelopeKaku2, PaperJapaneseEnvelopeKaku3,
    PaperJapaneseEnvelopeChou3, PaperJapaneseEnvelopeChou4, PaperLetterRotated, PaperA3Rotated,
    PaperA4Rotated, PaperA5Rotated, PaperB4Rotated, PaperB5Rotated, PaperJapanesePostcardRotated,
    PaperDoubleJapanesePostcardRotated, PaperA6Rotated, PaperJapaneseEnvelopeKaku2Rotated,
    PaperJapaneseEnvelopeKaku3Rotated, PaperJapaneseEnvelopeChou3Rotated,
    PaperJapaneseEnvelopeChou4Rotated, PaperB6, PaperB6Rotated, Paper12X11,
    PaperJapaneseEnvelopeYou4, PaperJapaneseEnvelopeYou4Rotated, PaperPrc16K, PaperPrc32K,
    PaperPrc32KBig, PaperPrcEnvelope1, PaperPrcEnvelope2, PaperPrcEnvelope3, PaperPrcEnvelope4,
    PaperPrcEnvelope5, PaperPrcEnvelope6, PaperPrcEnvelope7, PaperPrcEnvelope8, PaperPrcEnvelope9,
    PaperPrcEnvelope10, PaperPrc16KRotated, PaperPrc32KRotated, PaperPrc32KbigRotated,
    PaperPrcEnvelope1Rotated, PaperPrcEnvelope2Rotated, PaperPrcEnvelope3Rotated,
    PaperPrcEnvelope4Rotated, PaperPrcEnvelope5Rotated, PaperPrcEnvelope6Rotated,
    PaperPrcEnvelope7Rotated, PaperPrcEnvelope8Rotated, PaperPrcEnvelope9Rotated,
    PaperPrcEnvelope10Rotated
};

enum IgnoredError {
    IgnoreErrorNoError = 0, IgnoreErrorEvalError = 1, IgnoreErrorEmptyCellref = 2,
    IgnoreErrorNumberStoredAsText = 4, IgnoreErrorInconsistRange = 8,
    IgnoreErrorInconsistFormula = 16, IgnoreErrorTwodigTextyear = 32,
    IgnoreErrorUnlockFormula = 64, IgnoreErrorDataValidation = 128
};

enum EnhancedProtection {
    ProtectDefault = -1, ProtectAll = 0, ProtectObjects = 1, ProtectScenarios = 2,
    ProtectFormatCells = 4, ProtectFormatColumns = 8, ProtectFormatRows = 16,
    ProtectInsertColumns = 32, ProtectInsertRows = 64, ProtectInsertHyperlinks = 128,
    ProtectDeleteColumns = 256, ProtectDeleteRows = 512, ProtectSelLockedCells = 1024,
    ProtectSort = 2048, ProtectAutofilter = 4096, ProtectPivottables = 8192,
    ProtectSelUnlockedCells = 16384
};

enum DataValidationType {
    ValidationTypeNone, ValidationTypeWhole, ValidationTypeDecimal, ValidationTypeList,
    ValidationTypeDate, ValidationTypeTime, ValidationTypeTextlength, ValidationTypeCustom
};

enum DataValidationOperator {
    ValidationOpBetween, ValidationOpNotbetween, ValidationOpEqual, ValidationOpNotequal,
    ValidationOpLessthan, ValidationOpLessthanorequal, ValidationOpGreaterthan,
    ValidationOpGreaterthanorequal
};

enum DataValidationErrorStyle {
    ValidationErrstyleStop, ValidationErrstyleWarning, ValidationErrstyleInformation
};

enum FilterType {
    FilterValue, FilterTop10, FilterCustom, FilterDynamic, FilterColor, FilterIcon, FilterExt,
    FilterNotSet
};

enum Operator {
    OperatorEqual, OperatorGreaterThan, OperatorGreaterThanOrEqual, OperatorLessThan,
    OperatorLessThanOrEqual, OperatorNotEqual
};

}  // namespace quire
