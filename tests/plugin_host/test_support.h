#pragma once
// Shorthands for the host-level tests.
#include <gtest/gtest.h>

#include <string>

#include "test_host.h"

namespace plugintest {

using namespace testhost;

inline Host& host() { return Host::get(); }

// A new binary book, held for the scope.
inline Value newBook() { return host().create("QrBookKit"); }

// True when the book's last message says that its file engine is still to come.
inline bool notAvailableYet(const Value& book) {
    Value message = host().get(book, "ErrorMessage");
    bool pending = Host::utf8(message).find("not available yet") != std::string::npos;
    Host::release(message);
    return pending;
}

inline bool xmlEngineLinked() {
    Held book(host().create("QrBookKit", {boolean(true)}));
    return !host().raised();
}

}  // namespace plugintest
