// Shell completion from the command tree. The words before the one under the
// cursor are walked the way Resolve and ParseArguments read them, loosely:
// completion must help with a line that is still wrong, so it never reports
// anything and simply offers nothing where the line cannot lead anywhere.
#include "framework/Completion.h"

#include <algorithm>
#include <set>
#include <stdexcept>
#include <utility>

#include "framework/Format.h"
#include "framework/Runner.h"

namespace AutoCli {

namespace {

bool StartsWith(const std::string& text, const std::string& prefix) {
    return text.compare(0, prefix.size(), prefix) == 0;
}

// Where the walk over the typed words ended.
struct Position {
    std::vector<const NamespaceNode*> path;             // root first; the last is where the words lead
    boost::shared_ptr<CallSpec::InputSpec> parameters;  // when the last is a command
    std::set<std::string> given;                        // long names of the options already given
    bool valueOf = false;                               // the cursor word is the value of `option`
    boost::shared_ptr<CallSpec::ParameterSpec> option;  // null with valueOf: the --formatter value
};

const NamespaceNode& Here(const Position& at) {
    return *at.path.back();
}

bool IsCommand(const Position& at) {
    return at.parameters != nullptr;
}

// The command parameter a word names ("--name", "-n", with or without
// "=value"); null when it names none.
boost::shared_ptr<CallSpec::ParameterSpec> ParameterNamed(const Position& at, const std::string& word) {
    if (!IsCommand(at) || word.size() < 2 || word[0] != '-') return nullptr;
    const std::string name = word.substr(0, word.find('='));
    if (StartsWith(name, "--")) return at.parameters->FindByName(name.substr(2));
    return name.size() == 2 ? at.parameters->FindByShortName(name.substr(1)) : nullptr;
}

// The global option a word names, unless the command owns that name.
const GlobalOption* GlobalNamed(const Position& at, const std::string& word) {
    if (ParameterNamed(at, word)) return nullptr;
    const std::string name = word.substr(0, word.find('='));
    for (const GlobalOption& option : GlobalOptions()) {
        if (name == "--" + option.longName || (!option.shortName.empty() && name == "-" + option.shortName)) {
            return &option;
        }
    }
    return nullptr;
}

// Walks every word but the last. Returns false when the words lead nowhere.
bool Walk(const NamespaceNode& root, const std::vector<std::string>& words, Position& at) {
    at.path.push_back(&root);
    for (std::size_t i = 0; i + 1 < words.size(); ++i) {
        const std::string& word = words[i];
        const bool inlineValue = word.find('=') != std::string::npos;
        const bool last = i + 2 == words.size();  // the next word is the one under the cursor
        if (auto p = ParameterNamed(at, word)) {
            at.given.insert(p->GetName());
            if (p->GetType() != CallSpec::PARAM_FLAG && !inlineValue) {
                if (last) {
                    at.valueOf = true;
                    at.option = p;
                }
                ++i;
            }
        } else if (const GlobalOption* global = GlobalNamed(at, word)) {
            if (global->takesValue && !inlineValue) {
                if (last) at.valueOf = true;
                ++i;
            }
        } else if (!word.empty() && word[0] == '-') {
            // An option nothing declares. The command's own options are
            // still worth offering after it; in a namespace the line is
            // refused whatever follows.
            if (!IsCommand(at)) return false;
        } else if (IsCommand(at)) {
            return false;
        } else {
            boost::shared_ptr<NamespaceNode> child = Here(at).FindChild(word);
            if (!child) return false;
            at.path.push_back(child.get());
            if (Command* command = child->AsCommand()) at.parameters = command->GetInputSpec();
        }
    }
    return true;
}

// The candidate values of an option, before any filtering. A null option
// is the --formatter value.
std::vector<std::string> ValuesOf(const Position& at, const CallSpec::ParameterSpec* option) {
    if (!option) return FormatterNames();
    std::vector<std::string> values;
    if (const auto& constraint = option->GetConstraint()) {
        if (constraint->GetType() == CallSpec::CONSTRAINT_STRING_ENUM) {
            for (const auto& e : constraint->GetStringEnum()) values.push_back(e.value);
            return values;
        }
        if (constraint->GetType() == CallSpec::CONSTRAINT_INT_ENUM) {
            for (std::int64_t v : constraint->GetIntEnum()) values.push_back(std::to_string(v));
            return values;
        }
    }
    if (option->GetType() == CallSpec::PARAM_BOOL) return {"true", "false"};
    for (auto node = at.path.rbegin(); node != at.path.rend(); ++node) {
        if (const NamespaceNode::ValueCompleter* completer = (*node)->FindValueCompleter(option->GetName())) {
            try {
                return (*completer)();
            } catch (...) {
                // A host that cannot be read offers nothing; the terminal is
                // no place for its error in the middle of a line.
                return {};
            }
        }
    }
    return values;
}

std::vector<std::string> OptionNames(const Position& at) {
    std::vector<std::string> names;
    if (IsCommand(at)) {
        for (const auto& p : at.parameters->GetParameters()) {
            if (at.given.count(p->GetName())) continue;
            names.push_back("--" + p->GetName());
            if (!p->GetShortName().empty()) names.push_back("-" + p->GetShortName());
        }
    }
    for (const GlobalOption& option : GlobalOptions()) {
        if (option.longName == "version" && IsCommand(at)) continue;
        if (option.leadingOnly && at.path.size() > 1) continue;
        const std::string longName = "--" + option.longName;
        if (GlobalNamed(at, longName)) names.push_back(longName);
        if (!option.shortName.empty() && GlobalNamed(at, "-" + option.shortName)) {
            names.push_back("-" + option.shortName);
        }
    }
    return names;
}

std::vector<std::string> Candidates(const Position& at, const std::string& cur) {
    if (at.valueOf) return ValuesOf(at, at.option.get());
    const std::size_t eq = cur.find('=');
    if (!cur.empty() && cur[0] == '-' && eq != std::string::npos) {
        const std::string prefix = cur.substr(0, eq + 1);
        const CallSpec::ParameterSpec* option = ParameterNamed(at, cur).get();
        const GlobalOption* global = option ? nullptr : GlobalNamed(at, cur);
        if (option ? option->GetType() == CallSpec::PARAM_FLAG : !(global && global->takesValue)) return {};
        std::vector<std::string> values = ValuesOf(at, option);
        for (std::string& value : values) value = prefix + value;
        return values;
    }
    if (!cur.empty() && cur[0] == '-') return OptionNames(at);
    if (IsCommand(at)) return cur.empty() ? OptionNames(at) : std::vector<std::string>();
    std::vector<std::string> names;
    for (const auto& child : Here(at).GetChildren()) names.push_back(child.first);
    return names;
}

}  // namespace

std::vector<std::string> CompleteWords(const NamespaceNode& root, const std::vector<std::string>& words) {
    try {
        const std::string cur = words.empty() ? std::string() : words.back();
        Position at;
        if (!Walk(root, words, at)) return {};
        std::vector<std::string> matching;
        std::set<std::string> seen;
        for (const std::string& candidate : Candidates(at, cur)) {
            if (StartsWith(candidate, cur) && seen.insert(candidate).second) matching.push_back(candidate);
        }
        return matching;
    } catch (...) {
        // A command whose declaration throws offers nothing either.
        return {};
    }
}

std::vector<std::string> CompletionShells() {
    return {"bash", "zsh"};
}

std::string CompletionScript(const std::string& shell, const std::string& program, const std::string& entry) {
    std::string script;
    if (shell == "bash") {
        // Bash splits "--name=value" at the "=" (it is in COMP_WORDBREAKS),
        // so the words are joined back before they are passed on, and the
        // candidates, whole words, lose the part bash does not replace. The
        // word under the cursor loses its opening quote and its backslashes;
        // candidates with blanks or quotes come back escaped.
        script = R"(# bash completion for @PROGRAM@
@FUNCTION@() {
    local i word cur prefix candidate words=()
    for ((i = 1; i <= COMP_CWORD; i++)); do
        word=${COMP_WORDS[i]}
        if ((${#words[@]} > 0)) && [[ $word == = || ${COMP_WORDS[i - 1]} == = ]]; then
            words[-1]+=$word
        else
            words+=("$word")
        fi
    done
    ((${#words[@]} > 0)) || words=("")
    cur=${words[-1]}
    [[ $cur == [\"\']* ]] && cur=${cur:1}
    words[-1]=${cur//\\/}
    prefix=
    [[ $COMP_WORDBREAKS == *=* && $cur == *=* ]] && prefix=${cur%"${cur##*=}"}
    COMPREPLY=()
    while IFS= read -r candidate; do
        candidate=${candidate#"$prefix"}
        [[ $candidate == *[[:space:]\"\'\\]* ]] && printf -v candidate '%q' "$candidate"
        COMPREPLY+=("$candidate")
    done < <("${COMP_WORDS[0]/#\~/$HOME}" @ENTRY@ "${words[@]}" 2>/dev/null)
}
complete -F @FUNCTION@ @PROGRAM@
)";
    } else if (shell == "zsh") {
        // The words reach the program unquoted; compadd quotes what it
        // inserts and matches the whole word under the cursor.
        script = R"(#compdef @PROGRAM@
# zsh completion for @PROGRAM@
@FUNCTION@() {
    local -a candidates
    candidates=("${(@f)$("${words[1]}" @ENTRY@ "${(@Q)words[2,CURRENT]}" 2>/dev/null)}")
    compadd -- "${(@)candidates:#}"
}
if [[ $funcstack[1] == @FUNCTION@ ]]; then
    @FUNCTION@ "$@"
else
    compdef @FUNCTION@ @PROGRAM@
fi
)";
    } else {
        throw std::invalid_argument("Unknown shell '" + shell + "': one of " + JoinNames(CompletionShells()));
    }
    const std::pair<const char*, std::string> fills[] = {
        {"@FUNCTION@", "_" + program}, {"@PROGRAM@", program}, {"@ENTRY@", entry}};
    for (const auto& fill : fills) {
        const std::string token = fill.first;
        for (std::size_t at = script.find(token); at != std::string::npos; at = script.find(token, at)) {
            script.replace(at, token.size(), fill.second);
            at += fill.second.size();
        }
    }
    return script;
}

}  // namespace AutoCli
