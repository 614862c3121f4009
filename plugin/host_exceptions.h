#pragma once
// Host exceptions: raised now, they take effect in host code when the plugin method returns, so
// the method returns its zero value right after raising.

namespace quire_plugin {

// An instance of `className` (or of "RuntimeException" when that cannot be made) with the
// message and error number, raised in the host.
void raiseHostException(const char* className, const char* message, int errorNumber = 0);

inline void raiseNilObject(const char* message) { raiseHostException("NilObjectException", message); }
inline void raiseNotInitialized() { raiseNilObject("Object not initialized."); }

// "OutOfBoundsException" naming the parameter, the method, the allowed range
// [lowest, bound - 1] and the value.
void raiseOutOfRange(const char* parameter, const char* method, long long lowest, long long bound,
                     long long value);

}  // namespace quire_plugin
