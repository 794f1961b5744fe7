#include "network/StoredJson.h"

#include <charconv>

#include "hoststore/HostStore.h"

namespace PldCtl {
namespace Detail {

namespace {

bool IsDigit(char c) {
    return c >= '0' && c <= '9';
}

int HexValue(char c) {
    if (IsDigit(c)) return c - '0';
    if (c >= 'a' && c <= 'f') return c - 'a' + 10;
    if (c >= 'A' && c <= 'F') return c - 'A' + 10;
    return -1;
}

void AppendUtf8(std::string& out, std::uint32_t code) {
    if (code < 0x80) {
        out += static_cast<char>(code);
    } else if (code < 0x800) {
        out += static_cast<char>(0xC0 | (code >> 6));
        out += static_cast<char>(0x80 | (code & 0x3F));
    } else if (code < 0x10000) {
        out += static_cast<char>(0xE0 | (code >> 12));
        out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (code & 0x3F));
    } else {
        out += static_cast<char>(0xF0 | (code >> 18));
        out += static_cast<char>(0x80 | ((code >> 12) & 0x3F));
        out += static_cast<char>(0x80 | ((code >> 6) & 0x3F));
        out += static_cast<char>(0x80 | (code & 0x3F));
    }
}

}  // namespace

void JsonReader::Fail() {
    throw Store::HostStore::Default().DamagedObjectError();
}

void JsonReader::Literal(std::string_view word) {
    if (static_cast<std::size_t>(end_ - at_) < word.size() || std::string_view(at_, word.size()) != word) Fail();
    at_ += word.size();
}

void JsonReader::Unescape(std::string_view raw) {
    scratch_.clear();
    for (std::size_t i = 0; i < raw.size(); ++i) {
        if (raw[i] != '\\') {
            scratch_ += raw[i];
            continue;
        }
        const char escape = raw[++i];
        switch (escape) {
            case '"':
            case '\\':
            case '/':
                scratch_ += escape;
                break;
            case 'b':
                scratch_ += '\b';
                break;
            case 'f':
                scratch_ += '\f';
                break;
            case 'n':
                scratch_ += '\n';
                break;
            case 'r':
                scratch_ += '\r';
                break;
            case 't':
                scratch_ += '\t';
                break;
            case 'u': {
                auto hex4 = [&](std::size_t at) {
                    if (at + 4 > raw.size()) Fail();
                    std::uint32_t value = 0;
                    for (std::size_t k = at; k < at + 4; ++k) {
                        const int digit = HexValue(raw[k]);
                        if (digit < 0) Fail();
                        value = value << 4 | static_cast<std::uint32_t>(digit);
                    }
                    return value;
                };
                std::uint32_t code = hex4(i + 1);
                i += 4;
                if (code >= 0xD800 && code <= 0xDBFF) {
                    // A high surrogate must be followed by its low half.
                    if (i + 2 >= raw.size() || raw[i + 1] != '\\' || raw[i + 2] != 'u') Fail();
                    const std::uint32_t low = hex4(i + 3);
                    if (low < 0xDC00 || low > 0xDFFF) Fail();
                    code = 0x10000 + ((code - 0xD800) << 10) + (low - 0xDC00);
                    i += 6;
                } else if (code >= 0xDC00 && code <= 0xDFFF) {
                    Fail();
                }
                AppendUtf8(scratch_, code);
                break;
            }
            default:
                Fail();
        }
    }
}

bool JsonReader::Bool() {
    SkipBlanks();
    if (at_ < end_ && *at_ == 't') {
        Literal("true");
        return true;
    }
    Literal("false");
    return false;
}

JsonReader::Number JsonReader::ReadNumber() {
    SkipBlanks();
    const char* begin = at_;
    if (at_ < end_ && *at_ == '-') ++at_;
    // One zero, or digits not starting with zero.
    if (at_ == end_ || !IsDigit(*at_)) Fail();
    if (*at_ == '0') {
        ++at_;
    } else {
        while (at_ < end_ && IsDigit(*at_)) ++at_;
    }
    bool integral = true;
    if (at_ < end_ && *at_ == '.') {
        integral = false;
        if (++at_ == end_ || !IsDigit(*at_)) Fail();
        while (at_ < end_ && IsDigit(*at_)) ++at_;
    }
    if (at_ < end_ && (*at_ == 'e' || *at_ == 'E')) {
        integral = false;
        if (++at_ < end_ && (*at_ == '+' || *at_ == '-')) ++at_;
        if (at_ == end_ || !IsDigit(*at_)) Fail();
        while (at_ < end_ && IsDigit(*at_)) ++at_;
    }
    Number number{Number::Real, 0, 0, 0.0};
    if (integral) {
        // Integers past 64 bits read as reals, as the store's writer reads them.
        if (*begin == '-') {
            if (std::from_chars(begin, at_, number.signedValue).ec == std::errc()) {
                number.kind = Number::Signed;
                return number;
            }
        } else if (std::from_chars(begin, at_, number.unsignedValue).ec == std::errc()) {
            number.kind = Number::Unsigned;
            return number;
        }
    }
    if (std::from_chars(begin, at_, number.realValue).ec != std::errc()) Fail();
    return number;
}

void JsonReader::Skip() {
    // The closing characters of the containers being skipped, innermost last.
    std::string open;
    auto skipKey = [&] {
        bool escaped = false;
        RawString(escaped);
        Expect(':');
    };
    for (;;) {
        const Kind kind = Next();
        if (kind == Kind::Array || kind == Kind::Object) {
            const char close = kind == Kind::Array ? ']' : '}';
            ++at_;
            SkipBlanks();
            if (at_ < end_ && *at_ == close) {
                ++at_;
            } else {
                open += close;
                if (close == '}') skipKey();
                continue;
            }
        } else if (kind == Kind::String) {
            bool escaped = false;
            RawString(escaped);
        } else if (kind == Kind::Number) {
            ReadNumber();
        } else if (kind == Kind::Bool) {
            Bool();
        } else {
            Literal("null");
        }
        // A value is complete: close what ends here, or go on to the next
        // item of the innermost container.
        while (!open.empty()) {
            SkipBlanks();
            if (at_ == end_) Fail();
            if (*at_ == open.back()) {
                ++at_;
                open.pop_back();
                continue;
            }
            if (*at_ != ',') Fail();
            ++at_;
            if (open.back() == '}') skipKey();
            break;
        }
        if (open.empty()) break;
    }
    afterValue_ = true;
}

}  // namespace Detail
}  // namespace PldCtl
