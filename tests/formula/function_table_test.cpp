// The built-in function table: its size, ids, counts, masks and look-ups.

#include <gtest/gtest.h>

#include <set>

#include "xls/formula/function_table.h"

using namespace quire::xls;

TEST(FunctionTable, Holds373EntriesInIdOrder)
{
    ASSERT_EQ(functionCount(), 373u);
    std::set<unsigned> ids;
    for (size_t i = 0; i < functionCount(); ++i) {
        const FunctionInfo& f = functionTable()[i];
        if (i > 0) {
            EXPECT_LT(functionTable()[i - 1].id, f.id);
        }
        ids.insert(f.id);
        EXPECT_LE(f.fixedArgs, 4);
        EXPECT_EQ(f.refMask & ~AllArgumentsReference, 0u);
        EXPECT_EQ(findFunction(f.name), &f) << f.id;
        EXPECT_EQ(functionById(f.id), &f);
        EXPECT_EQ(functionName(f.id), f.name);
    }
    for (unsigned missing : {202u, 203u, 217u, 218u, 249u, 250u, 333u, 380u, 1000u}) {
        EXPECT_EQ(ids.count(missing), 0u);
        EXPECT_EQ(functionById(missing), nullptr);
        EXPECT_EQ(functionName(missing), L"");
    }
    EXPECT_EQ(functionTable()[372].id, 379);
}

TEST(FunctionTable, TellingRows)
{
    struct Row {
        unsigned id;
        const wchar_t* name;
        unsigned fixed;
        uint32_t mask;
    };
    const Row rows[] = {
        {0, L"COUNT", 0, 0x3FFFFFFF}, {1, L"IF", 0, 0},          {2, L"ISNA", 1, 0},
        {4, L"SUM", 0, 0},            {8, L"ROW", 0, 0x1},       {11, L"NPV", 0, 0x3FFFFFFE},
        {27, L"ROUND", 2, 0},         {28, L"LOOKUP", 0, 0x6},   {31, L"MID", 3, 0},
        {40, L"DCOUNT", 0, 0x7},      {49, L"LINEST", 0, 0xF},   {65, L"DATE", 3, 0},
        {78, L"OFFSET", 0, 0x1},      {92, L"SERIES", 0, 0x17},  {100, L"CHOOSE", 0, 0x3FFFFFFE},
        {102, L"VLOOKUP", 0, 0x6},    {221, L"TODAY", 0, 0},     {228, L"SUMPRODUCT", 0, 0},
        {236, L"CREATE.OBJECT", 0, 0x7FE}, {241, L"FORMULA.CONVERT", 0, 0x1E}, {345, L"SUMIF", 0, 0x5},
        {346, L"COUNTIF", 2, 0x1},    {255, L"USERDEFINED", 0, 0},
    };
    for (const Row& r : rows) {
        const FunctionInfo* f = functionById(r.id);
        ASSERT_NE(f, nullptr) << r.id;
        EXPECT_STREQ(f->name, r.name);
        EXPECT_EQ(f->fixedArgs, r.fixed) << r.id;
        EXPECT_EQ(f->refMask, r.mask) << r.id;
    }
}

TEST(FunctionTable, LookupIgnoresCase)
{
    ASSERT_NE(findFunction(L"vlookup"), nullptr);
    EXPECT_EQ(findFunction(L"vLookUp")->id, 102);
    EXPECT_EQ(findFunction(L"get.cell")->id, 185);
    EXPECT_EQ(findFunction(L"RTD")->id, 379);
    EXPECT_EQ(findFunction(L"IFERROR"), nullptr);
    EXPECT_EQ(findFunction(L""), nullptr);
}
