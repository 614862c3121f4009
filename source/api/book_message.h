#pragma once
#include <exception>
#include <new>
#include <string>

#include "qrerror.h"

namespace quire {

// The per-book message: "ok", a failure text, or a "warning: " text.
class BookMessage {
public:
    const char* c_str() const { return text_.c_str(); }
    const std::string& text() const { return text_; }
    void ok() {
        if (text_.size() != 2 || text_[0] != 'o' || text_[1] != 'k') text_.assign("ok");
    }
    void set(const char* text) { text_.assign(text); }
    void set(const std::string& text) { text_ = text; }

    // Runs one operation: the message becomes "ok" first, so a warning or failure set inside
    // stands; any exception becomes the message and the operation's failure value.
    template <class Result, class Body>
    Result guard(Result failure, Body&& body) noexcept {
        try {
            ok();
            return body();
        } catch (const std::bad_alloc&) {
            setQuietly("bad allocation");
        } catch (const std::exception& e) {
            setQuietly(e.what());
        } catch (...) {
            setQuietly("general failure");
        }
        return failure;
    }

    template <class Body>
    void guardVoid(Body&& body) noexcept {
        guard(0, [&] { body(); return 0; });
    }

private:
    void setQuietly(const char* text) noexcept {
        try {
            text_.assign(text);
        } catch (...) {
            text_.clear();  // No memory even for the text: an empty message is all that is left.
        }
    }

    std::string text_ = "ok";
};

}  // namespace quire
