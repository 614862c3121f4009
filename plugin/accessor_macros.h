#pragma once
// Property accessors that read or write one library value through one entry point. Each macro
// defines one accessor named `function` for the handle that `handleOf(self)` gives.
#include "glue.h"

#define QR_GET_INTEGER(function, handleOf, entry)                                   \
    RBInteger function(REALobject self, RBInteger) {                                \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return 0;           \
        return QR_CALL(entry)(handleOf(self));                                      \
    }
#define QR_SET_INTEGER(function, handleOf, entry)                                   \
    void function(REALobject self, RBInteger, RBInteger value) {                    \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return;             \
        QR_CALL(entry)(handleOf(self), static_cast<int>(value));                    \
    }
#define QR_GET_BOOLEAN(function, handleOf, entry)                                   \
    RBBoolean function(REALobject self, RBInteger) {                                \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return false;       \
        return hostBool(QR_CALL(entry)(handleOf(self)));                            \
    }
#define QR_SET_BOOLEAN(function, handleOf, entry)                                   \
    void function(REALobject self, RBInteger, RBBoolean value) {                    \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return;             \
        QR_CALL(entry)(handleOf(self), value ? 1 : 0);                              \
    }
#define QR_GET_DOUBLE(function, handleOf, entry)                                    \
    double function(REALobject self, RBInteger) {                                   \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return 0.0;         \
        return QR_CALL(entry)(handleOf(self));                                      \
    }
#define QR_SET_DOUBLE(function, handleOf, entry)                                    \
    void function(REALobject self, RBInteger, double value) {                       \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return;             \
        QR_CALL(entry)(handleOf(self), value);                                      \
    }
#define QR_GET_STRING(function, handleOf, entry)                                    \
    REALstring function(REALobject self, RBInteger) {                               \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return nullptr;     \
        return wideToHostString(QR_CALL(entry)(handleOf(self)));                    \
    }
#define QR_SET_STRING(function, handleOf, entry)                                    \
    void function(REALobject self, RBInteger, REALstring value) {                   \
        if (!QR_NEED(entry) || !requireHandle(handleOf(self))) return;             \
        HostText text(value);                                                       \
        QR_CALL(entry)(handleOf(self), text.wide());                                \
    }

// A property entry; `getter` and `setter` are accessor functions or null.
#define QR_PROPERTY(name, type, getter, setter)                                                              \
    REALproperty {                                                                                         \
        nullptr, name, type, kPropertyFlags, toProc(getter), toProc(setter), \
            0, nullptr, 0, nullptr, 0, nullptr                                                               \
    }
// The instance field of a library object class read (and written) by the host's own accessor.
#define QR_FIELD_PROPERTY(name, type, field, writable)                                                       \
    REALproperty {                                                                                         \
        nullptr, name, type, kPropertyFlags, REALstandardGetter, (writable) ? REALstandardSetter : nullptr,   \
            static_cast<int32_t>(offsetof(ObjectData, field)), nullptr, 0, nullptr, 0, nullptr               \
    }
