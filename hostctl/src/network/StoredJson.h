// A pull reader over the JSON text of one stored object, for decoding records
// without building a document tree: the caller walks the object's fields and
// takes each value as the type it expects, or skips it.
//
// Stored objects are small and written by the store itself, so a plain scan
// is as fast as a vectorised parser here, and it costs no extra library to
// load in every process. Text that is not JSON throws the store's error for
// a damaged object.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>

namespace PldCtl {
namespace Detail {

// Hidden: the reader's calls stay inside the library, without going through
// its symbol table.
class __attribute__((visibility("hidden"))) JsonReader {
public:
    explicit JsonReader(std::string_view text) : at_(text.data()), end_(text.data() + text.size()) {}

    // The kind of the value at the cursor, from its first character.
    enum class Kind { String, Number, Bool, Null, Array, Object };
    Kind Next() {
        SkipBlanks();
        if (at_ == end_) Fail();
        switch (*at_) {
            case '"':
                return Kind::String;
            case '{':
                return Kind::Object;
            case '[':
                return Kind::Array;
            case 't':
            case 'f':
                return Kind::Bool;
            case 'n':
                return Kind::Null;
            default:
                if (*at_ == '-' || (*at_ >= '0' && *at_ <= '9')) return Kind::Number;
                Fail();
        }
    }

    // Object members: BeginObject consumes "{"; each NextKey then gives the
    // next member's key (unescaped; valid until the next call) and moves to
    // its value, until it returns false having consumed "}".
    void BeginObject() {
        Expect('{');
        afterValue_ = false;
    }
    bool NextKey(std::string_view& key) {
        if (!MoreAfterValue('}')) return false;
        key = String();
        Expect(':');
        // The member counts as read once its value is: a scalar leaves this
        // set, a nested object or array clears it and sets it when it closes.
        afterValue_ = true;
        return true;
    }
    // The same for array items: NextItem returns false having consumed "]".
    void BeginArray() {
        Expect('[');
        afterValue_ = false;
    }
    bool NextItem() {
        if (!MoreAfterValue(']')) return false;
        afterValue_ = true;
        return true;
    }

    // Each takes a value of its kind; the caller checked Next(). A string
    // is valid until the next call.
    std::string_view String() {
        bool escaped = false;
        std::string_view raw = RawString(escaped);
        if (!escaped) return raw;
        Unescape(raw);
        return scratch_;
    }
    bool Bool();
    // A number, as an integer when it is written as one and fits 64 bits.
    struct Number {
        enum { Signed, Unsigned, Real } kind;
        std::int64_t signedValue;
        std::uint64_t unsignedValue;
        double realValue;
    };
    Number ReadNumber();
    // Skips one value of any kind, however deeply nested, without recursing.
    void Skip();

    // Throws unless only blanks are left.
    void End() {
        SkipBlanks();
        if (at_ != end_) Fail();
    }

private:
    [[noreturn]] static void Fail();
    void SkipBlanks() {
        while (at_ < end_ && (*at_ == ' ' || *at_ == '\n' || *at_ == '\r' || *at_ == '\t')) ++at_;
    }
    void Expect(char c) {
        SkipBlanks();
        if (at_ == end_ || *at_ != c) Fail();
        ++at_;
    }
    void Literal(std::string_view word);
    // After a value: consumes "," and reports true, or reports false having
    // consumed `close`.
    bool MoreAfterValue(char close) {
        SkipBlanks();
        if (at_ == end_) Fail();
        if (*at_ == close) {
            ++at_;
            afterValue_ = true;
            return false;
        }
        if (!afterValue_) return true;
        if (*at_ != ',') Fail();
        ++at_;
        return true;
    }
    // The raw text between the quotes at the cursor, consumed; `escaped` tells
    // whether it holds escapes.
    std::string_view RawString(bool& escaped) {
        SkipBlanks();
        if (at_ == end_ || *at_ != '"') Fail();
        const char* begin = ++at_;
        escaped = false;
        while (at_ < end_ && *at_ != '"') {
            if (static_cast<unsigned char>(*at_) < 0x20) Fail();
            if (*at_ == '\\') {
                escaped = true;
                if (++at_ == end_) Fail();
            }
            ++at_;
        }
        if (at_ == end_) Fail();
        return std::string_view(begin, static_cast<std::size_t>(at_++ - begin));
    }
    // Leaves the text of an escaped string in scratch_.
    void Unescape(std::string_view raw);

    const char* at_;
    const char* end_;
    // Set when the previous member or item has been read, so the next call
    // expects a separator first.
    bool afterValue_ = false;
    std::string scratch_;
};

}  // namespace Detail
}  // namespace PldCtl
