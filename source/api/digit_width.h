#pragma once
// Font measuring for column widths: the maximum digit width of a font, as spreadsheet programs
// use it to turn character widths into pixels.
#include <string>

namespace quire {

// The largest advance width, in whole pixels, of the digits 0 to 9 of `family` at `pixelSize`
// pixels. Measured with FreeType on the font fontconfig finds; a font of another family only
// counts when it is made to the same metrics (Liberation Sans for Arial, Carlito for Calibri,
// ...). 0 when no such font is installed. Results are kept, so asking again is cheap.
int measureMaxDigitWidth(const std::wstring& family, double pixelSize);

}  // namespace quire
