#pragma once
#include <string>
#include <string_view>

namespace lmx {

// Result codes of the XML runtime; 0 is success. The values are fixed because
// generated element classes and the Open XML engine compare against them.
enum elmx_error : int {
    ELMX_OK = 0,
    ELMX_NO_FILE = 1,
    ELMX_ALL_CARDINALITY_VIOLATION = 2,
    ELMX_ATTRIBUTE_ALREADY_READ = 3,
    ELMX_ATTRIBUTES_IN_ANONYMOUS_COMPOSITOR = 4,
    ELMX_BADLY_FORMED = 5,
    ELMX_BAD_CHAR_ENCODING = 6,
    ELMX_BAD_CHOICE = 7,
    ELMX_BAD_COMMENT = 8,
    ELMX_BAD_DTD = 9,
    ELMX_BAD_END_OF_ELEMENT = 10,
    ELMX_BAD_END_OF_START_TAG = 11,
    ELMX_BAD_END_TAG = 12,
    ELMX_BAD_XML_DECL = 13,
    ELMX_BAD_XML_VERSION = 14,
    ELMX_ENCODING_MISMATCH = 15,
    ELMX_ELEMENT_NOT_FOUND = 16,
    ELMX_EXTERNAL_ENTITY = 17,
    ELMX_FRACTION_DIGITS_EXCEEDED = 18,
    ELMX_LENGTH_TOO_LONG = 19,
    ELMX_LENGTH_TOO_SHORT = 20,
    ELMX_MANDATORY_ELEMENT_MISSING = 21,
    ELMX_NO_PATTERN_MATCHED = 22,
    ELMX_NOT_WELL_FORMED = 23,
    ELMX_RECURSIVE_ENTITY = 24,
    ELMX_REQUIRED_ATTRIBUTES_MISSING = 25,
    ELMX_OCCURRENCE_ERROR = 26,
    ELMX_TOTAL_DIGITS_EXCEEDED = 27,
    ELMX_UNABLE_TO_READ_ATTRIBUTE_VALUE = 28,
    ELMX_UNABLE_TO_READ_ELEMENT_VALUE = 29,
    ELMX_UNEXPECTED_ALL_EVENT = 30,
    ELMX_UNEXPECTED_COMPLEX_ELEMENT = 31,
    ELMX_UNEXPECTED_EMPTY_ELEMENT = 32,
    ELMX_UNEXPECTED_ENTITY = 33,
    ELMX_UNEXPECTED_EOM = 34,
    ELMX_VALUE_BAD_FORMAT = 35,
    ELMX_VALUE_EXCEEDS_MAX = 36,
    ELMX_VALUE_EXCEEDS_MIN = 37,
    ELMX_VALUE_NOT_ENUMERATED = 38,
    ELMX_UNEXPECTED_ATTRIBUTE = 39,
    ELMX_NILLED_ELEMENT_NOT_EMPTY = 40,
    ELMX_ENTITY_NOT_FOUND = 41,
    ELMX_UNDEFINED_ERROR = 42,
    ELMX_VALUE_DOES_NOT_MATCH_FIXED_CONSTRAINT = 43,
    ELMX_UNKNOWN_XSI_TYPE = 44,
    ELMX_TYPE_NOT_SET = 45,
    ELMX_OCCURRENCES_ON_MARSHALING = 46,
    ELMX_USER_DEFINED_1 = 1000,
    ELMX_USER_DEFINED_9 = 1008,
};

// The fixed text of a code; empty for a code that has none.
std::string_view error_message(elmx_error code);

// The first error met while reading one part.
struct c_error {
    elmx_error code = ELMX_OK;
    std::string item_name;          // element or attribute being handled
    std::string program_file;       // generated source that raised it
    int program_line = 0;
    int xml_line = -1;              // -1: not known
    std::string detail;             // the scanner's own explanation, if any

    // One line per field, each ending in a line feed.
    std::string report() const;
};

}  // namespace lmx
