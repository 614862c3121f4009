#pragma once
#include <string>

#include "ooxml/generated/opc-relationships.h"
#include "xlsx/xfile.h"

namespace quire {

// A relationships part: Relationship elements with Id, Type, Target and TargetMode.
class Relationships : public XmlFile<relationships::c_CT_Relationships> {
public:
    Relationships() : XmlFile("Relationships") {}

    // Reads the part and sets the identifier counter from the identifiers found.
    void read(const std::string& partName, const char* data, std::size_t size);
    void readFile(const std::string& partName, const std::string& path);

    // Adds a relationship and returns its new Id ("rId" and the next number).
    std::string add(const std::string& type, const std::string& target, bool external = false);
    // Target of the first relationship of the type; empty when there is none.
    std::string targetOfType(const std::string& type) const;
    std::string target(const std::string& id) const;
    std::string idOfTarget(const std::string& target) const;
    void removeById(const std::string& id);
    void removeByTarget(const std::string& target);
    std::size_t count() const { return document().size_Relationship(); }

private:
    void countIds();
    unsigned long counter_ = 0;
};

}  // namespace quire
