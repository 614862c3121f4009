#include "host_exceptions.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

#include "host_api.h"
#include "host_sdk.h"
#include "host_strings.h"

namespace quire_plugin {

void raiseHostException(const char* className, const char* message, int errorNumber) {
    REALobject exception = newInstance(className);
    if (!exception) exception = newInstance("RuntimeException");
    if (!exception) return;
    REALstring text = cStringToHostString(message, kEncodingUtf8);
    setPropertyString(exception, "Message", text);
    unlockString(text);
    setPropertyInteger(exception, "ErrorNumber", errorNumber);
    raiseException(exception);
    unlockObject(exception);
}

void raiseOutOfRange(const char* parameter, const char* method, long long lowest, long long bound,
                     long long value) {
    if (!parameter) parameter = "";
    if (!method) method = "";
    size_t size = std::strlen(parameter) + std::strlen(method) + 200;
    char* text = static_cast<char*>(std::calloc(size, 1));
    if (!text) {
        raiseHostException("OutOfBoundsException", "Out of Bounds");
        return;
    }
    std::snprintf(text, size, "The parameter %s %s%s is too %s. Range is %lld to %lld, but value is %lld.",
                  parameter, *method ? "to method " : "", method, value < lowest ? "small" : "big", lowest,
                  bound - 1, value);
    raiseHostException("OutOfBoundsException", text);
    std::free(text);
}

}  // namespace quire_plugin
