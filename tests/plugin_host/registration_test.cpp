// Class registration: every class, member and constant as host code sees them.
#include <fstream>
#include <set>

#include "test_support.h"

namespace plugintest {
namespace {

std::set<std::string> registeredMembers() {
    std::set<std::string> members;
    for (const ClassInfo& c : host().classes()) {
        for (const MethodInfo& m : c.methods)
            members.insert(c.name + (m.shared ? " shared method " : " method ") + m.declaration);
        for (const PropertyInfo& p : c.properties)
            members.insert(c.name + (p.shared ? " shared property " : " property ") + p.name + " as " + p.type);
        for (const std::string& k : c.constants) members.insert(c.name + " constant " + k);
    }
    return members;
}

std::set<std::string> expectedMembers() {
    std::set<std::string> members;
    std::ifstream file(QUIRE_MEMBERS_FILE);
    std::string line, className;
    while (std::getline(file, line)) {
        if (line.empty() || line[0] == '#') continue;
        if (line[0] == '[') {
            className = line.substr(1, line.size() - 2);
            continue;
        }
        members.insert(className + " " + line);
    }
    return members;
}

TEST(Registration, AllSevenClassesInOrder) {
    std::vector<std::string> names;
    for (const ClassInfo& c : host().classes()) names.push_back(c.name);
    EXPECT_EQ(names, (std::vector<std::string>{"QrFilterColumnKit", "QrAutoFilterKit", "QrFormatKit", "QrFontKit",
                                               "QrSheetKit", "QrBookKit", "QrCopyOptionsKit"}));
}

TEST(Registration, MembersMatchTheListExactly) {
    std::set<std::string> registered = registeredMembers(), expected = expectedMembers();
    ASSERT_GT(expected.size(), 600u);
    for (const std::string& m : expected) EXPECT_TRUE(registered.count(m)) << "not registered: " << m;
    for (const std::string& m : registered) EXPECT_TRUE(expected.count(m)) << "not in the list: " << m;
}

TEST(Registration, LayoutFollowsTheVersionCode) {
    double version = host().config().version.value_or(0.0);
    int expected = version >= 2013.04 ? 13 : version >= 2013.03 ? 12 : version >= 2013.0 ? 11 : version >= 2012.0 ? 10 : 9;
    EXPECT_EQ(host().pluginVersionCode(), expected);
    for (const ClassInfo& c : host().classes()) {
        EXPECT_EQ(c.oldLayout, expected < 10) << c.name;
        EXPECT_EQ(c.version, expected < 10 ? static_cast<uint32_t>(expected) : 13u) << c.name;
        EXPECT_EQ(c.flags, 4u);
    }
}

TEST(Registration, FlagsOfMembers) {
    const ClassInfo* sheet = host().findClass("QrSheetKit");
    ASSERT_NE(sheet, nullptr);
    for (const MethodInfo& m : sheet->methods) EXPECT_EQ(m.flags, m.declaration == "Constructor" ? 0x84u : 4u);
    for (const PropertyInfo& p : host().findClass("QrBookKit")->properties) EXPECT_EQ(p.flags, p.shared ? 0x26u : 6u);
}

TEST(Registration, NoValidationFindings) {
    for (const std::string& line : host().debugLines()) EXPECT_EQ(line.rfind("Error", 0), std::string::npos) << line;
}

}  // namespace
}  // namespace plugintest
