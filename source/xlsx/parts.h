#pragma once
// The XML parts of a book other than the workbook and its sheets.
#include "xlsx/flavour.h"
#include "xlsx/xfile.h"

namespace quire {

template <class Tag>
class Styles : public XmlFile<typename XmlFlavour<Tag>::Stylesheet> {
public:
    Styles() : XmlFile<typename XmlFlavour<Tag>::Stylesheet>("styleSheet") {}
    // The stylesheet of a new book: one font, two fills, one border, one format, one style.
    void makeDefault();
};

template <class Tag>
class SharedStrings : public XmlFile<typename XmlFlavour<Tag>::Sst> {
public:
    SharedStrings() : XmlFile<typename XmlFlavour<Tag>::Sst>("sst") {}
};

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
