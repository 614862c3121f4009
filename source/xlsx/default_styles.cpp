#include "xlsx/xml_styles.h"

namespace quire {

template <class Tag>
void Styles<Tag>::makeDefault() {
    auto& sheet = this->document();
    sheet.reset();
    auto& fonts = sheet.get_fonts();
    auto& font = fonts.append_font();
    font.append_sz().set_val(11.0);
    font.append_name().set_val(L"Calibri");
    fonts.set_count(1);

    auto& fills = sheet.get_fills();
    fills.append_fill().get_patternFill().set_patternType(0);  // none
    fills.append_fill().get_patternFill().set_patternType(17);  // gray125
    fills.set_count(2);

    auto& borders = sheet.get_borders();
    auto& border = borders.append_border();
    border.get_left();
    border.get_right();
    border.get_top();
    border.get_bottom();
    border.get_diagonal();
    borders.set_count(1);

    auto& styleXfs = sheet.get_cellStyleXfs();
    auto& styleXf = styleXfs.append_xf();
    styleXf.set_numFmtId(0);
    styleXf.set_fontId(0);
    styleXf.set_fillId(0);
    styleXf.set_borderId(0);
    styleXfs.set_count(1);

    auto& cellXfs = sheet.get_cellXfs();
    auto& xf = cellXfs.append_xf();
    xf.set_numFmtId(0);
    xf.set_fontId(0);
    xf.set_fillId(0);
    xf.set_borderId(0);
    xf.set_xfId(0);
    cellXfs.set_count(1);

    auto& cellStyles = sheet.get_cellStyles();
    auto& normal = cellStyles.append_cellStyle();
    normal.set_name(L"Normal");
    normal.set_xfId(0);
    normal.set_builtinId(0);
    cellStyles.set_count(1);
    buildObjects();
}

template void Styles<excelNormal_tag>::makeDefault();
template void Styles<excelStrict_tag>::makeDefault();

}  // namespace quire
