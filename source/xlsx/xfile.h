#pragma once
// The part objects of an Open XML package.
#include <functional>
#include <memory>
#include <ostream>
#include <streambuf>
#include <string>

#include "api/qrerror.h"
#include "lmx/lmx.h"

namespace quire {

// One part of the package.
class XFile {
public:
    // Writes the part into `fileName`, or with an empty name into `buffer`.
    virtual void write(const std::string& fileName, std::string& buffer) = 0;
    virtual ~XFile() = default;
};

// Bytes of a part the engine does not interpret, written back unchanged.
class BinaryFile : public XFile {
public:
    explicit BinaryFile(std::string bytes) : bytes_(std::move(bytes)) {}
    void write(const std::string& fileName, std::string& buffer) override;
    const std::string& bytes() const { return bytes_; }

private:
    std::string bytes_;
};

// A chart sheet: kept as its bytes.
class XMLChartSheet : public BinaryFile {
public:
    using BinaryFile::BinaryFile;
};

// Reads one XML part into a bound document; the message names the part and the reader's error.
std::string xmlErrorText(const std::string& partName, const lmx::c_xml_reader& reader, lmx::elmx_error code);
// Writes a document through `marshal` into a file or a buffer; a writer error becomes a qrerror.
void writeXmlText(const std::string& fileName, std::string& buffer, const std::string& text);

// Receives a part's bytes piece by piece.
using ByteSink = std::function<void(const char* data, std::size_t size)>;

// Hands what an output stream receives to a sink, unbuffered (the XML writer buffers already).
class SinkStreambuf : public std::streambuf {
public:
    explicit SinkStreambuf(const ByteSink& sink) : sink_(sink) {}

protected:
    std::streamsize xsputn(const char* data, std::streamsize size) override {
        sink_(data, static_cast<std::size_t>(size));
        return size;
    }
    int_type overflow(int_type ch) override {
        if (traits_type::eq_int_type(ch, traits_type::eof())) return traits_type::not_eof(ch);
        const char byte = traits_type::to_char_type(ch);
        sink_(&byte, 1);
        return ch;
    }

private:
    const ByteSink& sink_;
};

// A part written as XML text, which can go out in pieces instead of as one text.
class XmlPart : public XFile {
public:
    virtual void writeTo(const ByteSink& sink) = 0;
};

// An XML part whose document element is bound to the generated class T.
template <class T>
class XmlFile : public XmlPart {
public:
    explicit XmlFile(const char* rootName) : rootName_(rootName) {}

    T& document() { return document_; }
    const T& document() const { return document_; }

    // From memory, or with an empty buffer from the named file.
    void read(const std::string& partName, const char* data, std::size_t size) {
        lmx::c_xml_reader_memory reader(data, size);
        parse(partName, reader);
    }
    void readFile(const std::string& partName, const std::string& path) {
        lmx::c_xml_reader_file reader(path);
        parse(partName, reader);
    }

    void write(const std::string& fileName, std::string& buffer) override {
        std::string text;
        writeTo([&text](const char* data, std::size_t size) { text.append(data, size); });
        if (fileName.empty()) buffer.swap(text);
        else writeXmlText(fileName, buffer, text);
    }

    void writeTo(const ByteSink& sink) override {
        SinkStreambuf target(sink);
        std::ostream stream(&target);
        {
            lmx::c_xml_writer writer(stream, lmx::c_xml_writer::flag_declaration | lmx::c_xml_writer::flag_standalone);
            const lmx::elmx_error result = document_.marshal(writer, rootName_);
            if (result != lmx::ELMX_OK) throw qrerror(std::string(lmx::error_message(result)));
        }
        sink("\n", 1);
    }

protected:
    virtual lmx::elmx_error unmarshalRoot(lmx::c_xml_reader& reader) {
        static const std::string name = localName(rootName_);
        return document_.unmarshal(reader, name);
    }

private:
    static std::string localName(const char* qname) {
        std::string name = qname;
        const std::size_t colon = name.find(':');
        return colon == std::string::npos ? name : name.substr(colon + 1);
    }
    void parse(const std::string& partName, lmx::c_xml_reader& reader) {
        document_ = T();
        lmx::elmx_error result = reader.read_root();
        if (result == lmx::ELMX_OK) result = unmarshalRoot(reader);
        if (result != lmx::ELMX_OK) throw qrerror(xmlErrorText(partName, reader, result));
    }

    const char* rootName_;
    T document_;
};

}  // namespace quire
