// Argument parsing and checking. Everything here runs before a command's
// ExecuteInternal, so a command only ever sees arguments of the right type
// that satisfy their declared constraints.
#include <algorithm>
#include <cctype>
#include <limits>
#include <set>

#include <regex>

#include "framework/Format.h"
#include "framework/Runner.h"

namespace AutoCli {

namespace {

std::string Lower(std::string text) {
    std::transform(text.begin(), text.end(), text.begin(), [](unsigned char c) { return std::tolower(c); });
    return text;
}

std::size_t EditDistance(const std::string& a, const std::string& b) {
    std::vector<std::size_t> row(b.size() + 1);
    for (std::size_t j = 0; j <= b.size(); ++j) row[j] = j;
    for (std::size_t i = 1; i <= a.size(); ++i) {
        std::size_t diagonal = row[0];
        row[0] = i;
        for (std::size_t j = 1; j <= b.size(); ++j) {
            std::size_t above = row[j];
            row[j] = std::min({row[j] + 1, row[j - 1] + 1, diagonal + (a[i - 1] == b[j - 1] ? 0 : 1)});
            diagonal = above;
        }
    }
    return row[b.size()];
}

bool LooksLikeNegativeNumber(const std::string& token) {
    return token.size() > 1 && token[0] == '-' && std::isdigit(static_cast<unsigned char>(token[1]));
}

std::string OptionName(const CallSpec::ParameterSpec& p) {
    return "--" + p.GetName();
}

void CheckIntConstraint(const CallSpec::ParameterSpec& p, const std::string& text, std::int64_t value) {
    const auto& c = p.GetConstraint();
    if (!c) return;
    switch (c->GetType()) {
        case CallSpec::CONSTRAINT_INT_RANGE:
            if (value < c->GetMin() || value > c->GetMax()) {
                throw UsageError("Value " + text + " for " + OptionName(p) + " is out of range: it must be between " +
                                 std::to_string(c->GetMin()) + " and " + std::to_string(c->GetMax()));
            }
            return;
        case CallSpec::CONSTRAINT_INT_ENUM: {
            const auto& allowed = c->GetIntEnum();
            if (std::find(allowed.begin(), allowed.end(), value) == allowed.end()) {
                std::vector<std::string> texts;
                for (std::int64_t v : allowed) texts.push_back(std::to_string(v));
                throw UsageError("Value " + text + " for " + OptionName(p) + " is not allowed: it must be one of " +
                                 JoinNames(texts));
            }
            return;
        }
        default:
            throw std::logic_error("parameter " + OptionName(p) + " is an integer but has a string constraint");
    }
}

void CheckStringConstraint(const CallSpec::ParameterSpec& p, const std::string& value) {
    const auto& c = p.GetConstraint();
    if (!c) return;
    switch (c->GetType()) {
        case CallSpec::CONSTRAINT_STRING_ENUM: {
            std::vector<std::string> allowed;
            for (const auto& e : c->GetStringEnum()) allowed.push_back(e.value);
            if (std::find(allowed.begin(), allowed.end(), value) != allowed.end()) return;
            std::string message =
                "Invalid value '" + value + "' for " + OptionName(p) + ": it must be one of " + JoinNames(allowed);
            std::string suggestion = SuggestClosest(value, allowed);
            if (!suggestion.empty()) message += ". Did you mean '" + suggestion + "'?";
            throw UsageError(message);
        }
        case CallSpec::CONSTRAINT_STRING_REGEX: {
            // Compiled per check: a command line has few options, and keeping
            // compiled patterns around would cost every run that does not use them.
            std::regex pattern(c->GetStringRegex());
            if (!std::regex_match(value, pattern)) {
                throw UsageError("Invalid value '" + value + "' for " + OptionName(p) + ": it must match " +
                                 c->GetStringRegex());
            }
            return;
        }
        default:
            throw std::logic_error("parameter " + OptionName(p) + " is a string but has an integer constraint");
    }
}

void StoreValue(const CallSpec::ParameterSpec& p, const std::string& text, CallSpec::Input& input) {
    switch (p.GetType()) {
        case CallSpec::PARAM_STRING:
            CheckStringConstraint(p, text);
            input.SetString(p.GetName(), text);
            return;
        case CallSpec::PARAM_INT: {
            std::int64_t value = 0;
            if (!ParseInt64(text, value)) {
                bool digits =
                    !text.empty() && std::all_of(text.begin() + (text[0] == '-' || text[0] == '+'), text.end(),
                                                 [](unsigned char ch) { return std::isdigit(ch); });
                if (digits && text.size() > 1) {
                    throw UsageError("Value " + text + " for " + OptionName(p) + " does not fit a 64-bit integer");
                }
                throw UsageError("Invalid value '" + text + "' for " + OptionName(p) + ": expected an integer");
            }
            CheckIntConstraint(p, text, value);
            input.SetInt(p.GetName(), text, value);
            return;
        }
        case CallSpec::PARAM_BOOL: {
            bool value = false;
            if (!ParseBoolWord(text, value)) {
                throw UsageError("Invalid value '" + text + "' for " + OptionName(p) + ": expected true or false");
            }
            input.SetBool(p.GetName(), text, value);
            return;
        }
        case CallSpec::PARAM_FLAG:
            input.SetFlag(p.GetName());
            return;
    }
}

[[noreturn]] void UnknownOption(const CallSpec::InputSpec& declared, const std::string& option) {
    std::vector<std::string> names, letters;
    for (const auto& q : declared.GetParameters()) {
        names.push_back(q->GetName());
        if (!q->GetShortName().empty()) letters.push_back(q->GetShortName());
    }
    std::string message = "Unknown option " + option;
    const std::string suggestion = SuggestOption(option, names, letters);
    if (!suggestion.empty()) message += ". Did you mean " + suggestion + "?";
    throw UsageError(message);
}

}  // namespace

std::string SuggestOption(const std::string& option, const std::vector<std::string>& names,
                          const std::vector<std::string>& letters) {
    if (option.compare(0, 2, "--") == 0) {
        const std::string name =
            option.substr(2, option.find('=') == std::string::npos ? std::string::npos : option.find('=') - 2);
        const std::string suggestion = SuggestClosest(name, names);
        return suggestion.empty() ? suggestion : "--" + suggestion;
    }
    if (option.size() < 2 || option[0] != '-') return "";
    if (option.size() == 2 || option[2] == '=') {
        // Any two letters are one edit apart, so only the same letter in the
        // other case is a likely slip.
        const std::string letter = Lower(option.substr(1, 1));
        for (const auto& candidate : letters) {
            if (Lower(candidate) == letter) return "-" + candidate;
        }
        return "";
    }
    // A long name typed with one dash.
    const std::string suggestion = SuggestClosest(option.substr(1), names);
    return suggestion.empty() ? suggestion : "--" + suggestion;
}

bool ParseBoolWord(const std::string& text, bool& value) {
    const std::string word = Lower(text);
    if (word == "true" || word == "1" || word == "yes") {
        value = true;
        return true;
    }
    if (word == "false" || word == "0" || word == "no") {
        value = false;
        return true;
    }
    return false;
}

bool ParseInt64(const std::string& text, std::int64_t& value) {
    std::size_t i = 0;
    bool negative = false;
    if (i < text.size() && (text[i] == '-' || text[i] == '+')) negative = text[i++] == '-';
    if (i == text.size()) return false;
    // Accumulate as a negative number so that INT64_MIN, whose magnitude has
    // no positive counterpart, parses too.
    std::int64_t acc = 0;
    const std::int64_t min = std::numeric_limits<std::int64_t>::min();
    for (; i < text.size(); ++i) {
        if (!std::isdigit(static_cast<unsigned char>(text[i]))) return false;
        int digit = text[i] - '0';
        if (acc < (min + digit) / 10) return false;
        acc = acc * 10 - digit;
    }
    if (!negative) {
        if (acc == min) return false;
        acc = -acc;
    }
    value = acc;
    return true;
}

std::string SuggestClosest(const std::string& word, const std::vector<std::string>& candidates) {
    std::string best;
    std::size_t bestDistance = std::numeric_limits<std::size_t>::max();
    for (const auto& candidate : candidates) {
        std::size_t distance = EditDistance(Lower(word), Lower(candidate));
        // A word the user cut short is as good as a one-letter slip.
        if (word.size() >= 3 && candidate.compare(0, word.size(), word) == 0)
            distance = std::min<std::size_t>(distance, 1);
        if (distance < bestDistance) {
            bestDistance = distance;
            best = candidate;
        }
    }
    const std::size_t tolerance = std::max<std::size_t>(2, word.size() / 3);
    return bestDistance <= tolerance ? best : std::string();
}

boost::shared_ptr<CallSpec::Input> ParseArguments(const CallSpec::InputSpec& declared,
                                                  const std::vector<std::string>& args) {
    boost::shared_ptr<CallSpec::Input> input = CallSpec::Input::New();
    std::set<std::string> given;

    for (std::size_t i = 0; i < args.size(); ++i) {
        const std::string& token = args[i];
        boost::shared_ptr<CallSpec::ParameterSpec> p;
        std::string inlineValue;
        bool hasInlineValue = false;

        if (token.size() > 2 && token.compare(0, 2, "--") == 0) {
            std::string name = token.substr(2);
            std::size_t eq = name.find('=');
            if (eq != std::string::npos) {
                inlineValue = name.substr(eq + 1);
                hasInlineValue = true;
                name.resize(eq);
            }
            p = declared.FindByName(name);
            if (!p) UnknownOption(declared, "--" + name);
        } else if (token.size() >= 2 && token[0] == '-' && token[1] != '-' && !LooksLikeNegativeNumber(token)) {
            if (token.size() > 2 && token[2] != '=') UnknownOption(declared, token);
            p = declared.FindByShortName(token.substr(1, 1));
            if (!p) UnknownOption(declared, token.substr(0, 2));
            if (token.size() > 2) {
                inlineValue = token.substr(3);
                hasInlineValue = true;
            }
        } else {
            throw UsageError("Unexpected argument '" + token + "'");
        }

        if (!given.insert(p->GetName()).second) {
            throw UsageError("Option " + OptionName(*p) + " is given more than once");
        }
        if (p->GetType() == CallSpec::PARAM_FLAG) {
            if (hasInlineValue) throw UsageError("Option " + OptionName(*p) + " takes no value");
            StoreValue(*p, "", *input);
            continue;
        }
        if (!hasInlineValue) {
            const bool nextIsValue =
                i + 1 < args.size() && (args[i + 1].empty() || args[i + 1][0] != '-' ||
                                        (p->GetType() == CallSpec::PARAM_INT && LooksLikeNegativeNumber(args[i + 1])));
            if (!nextIsValue) {
                throw UsageError("Option " + OptionName(*p) + " needs a value" +
                                 (p->GetType() == CallSpec::PARAM_BOOL ? " (true or false)" : ""));
            }
            inlineValue = args[++i];
        }
        StoreValue(*p, inlineValue, *input);
    }

    for (const auto& p : declared.GetParameters()) {
        if (p->IsRequired() && !given.count(p->GetName())) {
            throw UsageError("Missing required option " + OptionName(*p));
        }
    }
    return input;
}

}  // namespace AutoCli
