#pragma once
#include <map>
#include <string>

#include "ooxml/generated/opc-contentTypes.h"
#include "xlsx/xfile.h"

namespace quire {

// [Content_Types].xml: Default elements by extension and Override elements by part name.
class ContentTypes : public XmlFile<contentypes::c_CT_Types> {
public:
    ContentTypes() : XmlFile("Types") {}

    // Override of the part, else Default of its extension, else empty.
    std::string contentType(const std::string& partName) const;
    void setOverride(const std::string& partName, const std::string& contentType);
    void addDefault(const std::string& extension, const std::string& contentType);
    void removeOverride(const std::string& partName);
    bool hasDefault(const std::string& extension) const;
};

}  // namespace quire
