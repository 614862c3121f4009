#pragma once

// Token ids of parsed formulas (MS-XLS Ptg). Operand tokens from 0x20 on
// come in three classes: the base id is the reference class, +0x20 the value
// class and +0x40 the array class.

#include <cstdint>

namespace quire::xls::ptg {

constexpr uint8_t Exp = 0x01;
constexpr uint8_t Tbl = 0x02;
constexpr uint8_t Add = 0x03;
constexpr uint8_t Sub = 0x04;
constexpr uint8_t Mul = 0x05;
constexpr uint8_t Div = 0x06;
constexpr uint8_t Power = 0x07;
constexpr uint8_t Concat = 0x08;
constexpr uint8_t Lt = 0x09;
constexpr uint8_t Le = 0x0A;
constexpr uint8_t Eq = 0x0B;
constexpr uint8_t Ge = 0x0C;
constexpr uint8_t Gt = 0x0D;
constexpr uint8_t Ne = 0x0E;
constexpr uint8_t Isect = 0x0F;
constexpr uint8_t Union = 0x10;
constexpr uint8_t Range = 0x11;
constexpr uint8_t Uplus = 0x12;
constexpr uint8_t Uminus = 0x13;
constexpr uint8_t Percent = 0x14;
constexpr uint8_t Paren = 0x15;
constexpr uint8_t MissArg = 0x16;
constexpr uint8_t Str = 0x17;
constexpr uint8_t Extend = 0x18;
constexpr uint8_t Attr = 0x19;
constexpr uint8_t Err = 0x1C;
constexpr uint8_t Bool = 0x1D;
constexpr uint8_t Int = 0x1E;
constexpr uint8_t Num = 0x1F;

// Base ids (reference class) of the classed tokens.
constexpr uint8_t Array = 0x20;
constexpr uint8_t Func = 0x21;
constexpr uint8_t FuncVar = 0x22;
constexpr uint8_t Name = 0x23;
constexpr uint8_t Ref = 0x24;
constexpr uint8_t Area = 0x25;
constexpr uint8_t MemArea = 0x26;
constexpr uint8_t MemErr = 0x27;
constexpr uint8_t MemNoMem = 0x28;
constexpr uint8_t MemFunc = 0x29;
constexpr uint8_t RefErr = 0x2A;
constexpr uint8_t AreaErr = 0x2B;
constexpr uint8_t RefN = 0x2C;
constexpr uint8_t AreaN = 0x2D;
constexpr uint8_t NameX = 0x39;
constexpr uint8_t Ref3d = 0x3A;
constexpr uint8_t Area3d = 0x3B;
constexpr uint8_t RefErr3d = 0x3C;
constexpr uint8_t AreaErr3d = 0x3D;

// Operand classes, added to a base id.
constexpr uint8_t ClassRef = 0x00;
constexpr uint8_t ClassValue = 0x20;
constexpr uint8_t ClassArray = 0x40;

// Base id of a classed token (0x20-0x7F); other ids unchanged.
inline uint8_t baseId(uint8_t id)
{
    return id >= 0x20 && id < 0x80 ? static_cast<uint8_t>((id & 0x1F) | 0x20) : id;
}

// Attribute kinds of ptgAttr (second byte).
constexpr uint8_t AttrVolatile = 0x01;
constexpr uint8_t AttrIf = 0x02;
constexpr uint8_t AttrChoose = 0x04;
constexpr uint8_t AttrGoto = 0x08;
constexpr uint8_t AttrSum = 0x10;
constexpr uint8_t AttrBaxcel = 0x20;
constexpr uint8_t AttrBaxcelVolatile = 0x21;
constexpr uint8_t AttrSpace = 0x40;
constexpr uint8_t AttrSpaceVolatile = 0x41;

// Relative flags in the column field of a reference.
constexpr uint16_t ColumnMask = 0x3FFF;
constexpr uint16_t RowRelative = 0x8000;
constexpr uint16_t ColRelative = 0x4000;

} // namespace quire::xls::ptg
