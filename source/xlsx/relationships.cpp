#include "xlsx/relationships.h"

#include <cstdlib>

#include "api/wide_text.h"
#include "xlsx/package_names.h"

namespace quire {

void Relationships::read(const std::string& partName, const char* data, std::size_t size) {
    XmlFile::read(partName, data, size);
    countIds();
}

void Relationships::readFile(const std::string& partName, const std::string& path) {
    XmlFile::readFile(partName, path);
    countIds();
}

void Relationships::countIds() {
    counter_ = 0;
    const auto& rels = document();
    for (std::size_t i = 0; i < rels.size_Relationship(); ++i) {
        const std::wstring& id = rels.get_Relationship(i).get_Id();
        if (id.size() <= 3) continue;
        const unsigned long number = std::wcstoul(id.c_str() + 3, nullptr, 10);
        if (number > counter_) counter_ = number;
    }
}

std::string Relationships::add(const std::string& type, const std::string& target, bool external) {
    ++counter_;
    const std::string id = "rId" + std::to_string(counter_);
    std::string escaped;
    for (char c : target) {
        if (c == ' ')
            escaped += "%20";
        else
            escaped += c;
    }
    auto& rel = document().append_Relationship();
    rel.set_Id(fromUtf8(id));
    rel.set_Type(fromUtf8(type));
    rel.set_Target(fromUtf8(escaped));
    if (external || type == package::kRelHyperlink) rel.set_TargetMode(relationships::ST_TargetMode_External);
    return id;
}

std::string Relationships::targetOfType(const std::string& type) const {
    const std::wstring wanted = fromUtf8(type);
    const auto& rels = document();
    for (std::size_t i = 0; i < rels.size_Relationship(); ++i)
        if (rels.get_Relationship(i).get_Type() == wanted) return toUtf8(rels.get_Relationship(i).get_Target());
    return {};
}

std::string Relationships::target(const std::string& id) const {
    const std::wstring wanted = fromUtf8(id);
    const auto& rels = document();
    for (std::size_t i = 0; i < rels.size_Relationship(); ++i)
        if (rels.get_Relationship(i).get_Id() == wanted) return toUtf8(rels.get_Relationship(i).get_Target());
    return {};
}

std::string Relationships::idOfTarget(const std::string& target) const {
    const std::wstring wanted = fromUtf8(target);
    const auto& rels = document();
    for (std::size_t i = 0; i < rels.size_Relationship(); ++i)
        if (rels.get_Relationship(i).get_Target() == wanted) return toUtf8(rels.get_Relationship(i).get_Id());
    return {};
}

void Relationships::removeById(const std::string& id) {
    const std::wstring wanted = fromUtf8(id);
    auto& rels = document();
    for (std::size_t i = rels.size_Relationship(); i > 0; --i)
        if (rels.get_Relationship(i - 1).get_Id() == wanted) rels.delete_Relationship(i - 1);
}

void Relationships::removeByTarget(const std::string& target) {
    const std::wstring wanted = fromUtf8(target);
    auto& rels = document();
    for (std::size_t i = rels.size_Relationship(); i > 0; --i)
        if (rels.get_Relationship(i - 1).get_Target() == wanted) rels.delete_Relationship(i - 1);
}

}  // namespace quire
