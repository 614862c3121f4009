#pragma once
// The XML parts of a book other than the workbook and its sheets.
#include "xlsx/flavour.h"
#include "xlsx/xfile.h"
#include "xlsx/xml_shared_strings.h"
#include "xlsx/xml_styles.h"

namespace quire {

template <class Tag>
class Drawing : public XmlFile<typename XmlFlavour<Tag>::Drawing> {
public:
    Drawing() : XmlFile<typename XmlFlavour<Tag>::Drawing>("xdr:wsDr") {}
};

template <class Tag>
class Table : public XmlFile<typename XmlFlavour<Tag>::Table> {
public:
    Table() : XmlFile<typename XmlFlavour<Tag>::Table>("table") {}
};

template <class Tag>
class Comments : public XmlFile<typename XmlFlavour<Tag>::Comments> {
public:
    Comments() : XmlFile<typename XmlFlavour<Tag>::Comments>("comments") {}
};

}  // namespace quire
