// orvix-hostsim: creates a simulated host from a profile, shows it as one,
// replaces it, and arms the faults that tests use to reach error paths.

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <iostream>
#include <map>
#include <stdexcept>
#include <string>
#include <vector>

#include "Graph.h"
#include "hoststore/HostStore.h"
#include "orvixtext/Utf8.h"

namespace {

using PldCtl::Store::HostStore;
using PldCtl::Store::Json;

// Exit statuses, the same table as orvixcli's.
constexpr int kOk = 0;
constexpr int kFailed = 1;
constexpr int kUsage = 2;
constexpr int kUnusable = 3;

// A command line that cannot be understood.
class UsageError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// A request that could not be carried out although the store is fine.
class RequestError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

struct Option {
    const char* name;
    const char* value;  // its placeholder in help; nullptr for a flag
    bool required;
    const char* help;
};

struct Arguments {
    std::map<std::string, std::string> options;
    std::vector<std::string> operands;

    bool Has(const std::string& name) const { return options.count(name) != 0; }
    std::string Get(const std::string& name) const {
        const auto found = options.find(name);
        return found == options.end() ? std::string() : found->second;
    }
};

struct Command {
    const char* name;  // one word, or a group and a word ("fault add")
    std::vector<const char*> operands;
    std::vector<Option> options;
    const char* summary;
    const char* description;
    int (*run)(const Arguments& args);
};

int Init(const Arguments& args) {
    const std::string origin = args.Has("profile") ? args.Get("profile") : HostStore::ResolveProfileOrigin();
    const std::string text =
        args.Has("profile") ? PldCtl::Store::ReadProfileFile(origin) : HostStore::ResolveProfileText();
    const Json profile = PldCtl::Store::ParseProfile(text, origin);
    const std::string path = HostStore::ResolvePath();
    if (PldCtl::Store::PathExists(path)) {
        if (!args.Has("force")) throw RequestError("host store '" + path + "' exists; use --force to replace it");
        std::unique_ptr<HostStore> store;
        try {
            store = HostStore::Open(path);
        } catch (const PldCtl::Store::UnusableFileError& e) {
            // Only a file found not to be a usable store is replaced; one
            // that cannot be read now (rights, a full disk) stays as it is.
            std::cerr << "orvix-hostsim: " << Orvix::Text::EscapeControls(e.what()) << "; replacing it\n";
            HostStore::Replace(path, profile, origin);
            return kOk;
        }
        store->Load(profile);
        store->ClearFaults();
        return kOk;
    }
    HostStore::Create(path, profile, origin);
    return kOk;
}

int Dump(const Arguments&) {
    std::cout << PldCtl::Store::FormatProfile(HostStore::Default().Dump()) << '\n';
    return kOk;
}

int Load(const Arguments& args) {
    const std::string& file = args.operands.at(0);
    const Json profile = PldCtl::Store::ParseProfile(PldCtl::Store::ReadProfileFile(file), file);
    // A store created here already holds the profile; loading it again is
    // cheap and keeps one path for both cases.
    HostStore::OpenOrCreate(HostStore::ResolvePath(), profile, file)->Load(profile);
    return kOk;
}

int FaultAdd(const Arguments& args) {
    PldCtl::Store::Fault fault;
    fault.operation = args.operands.at(0);
    fault.key = args.Get("key");
    fault.message = args.Get("message");
    if (args.Has("count")) {
        const std::string count = args.Get("count");
        char* end = nullptr;
        errno = 0;
        fault.remaining = std::strtoll(count.c_str(), &end, 10);
        if (count.empty() || *end != '\0' || errno != 0) throw UsageError("--count: '" + count + "' is not an integer");
    }
    // Bad arguments are refused before a missing store is created.
    PldCtl::Store::CheckFaultArguments(fault);
    std::cout << HostStore::Default().AddFault(fault) << '\n';
    return kOk;
}

// Columns left-aligned and two blanks apart; the last one is not padded.
// Cells hold what users typed (fault keys and messages) and are shown with
// their control characters escaped.
void PrintTable(std::vector<std::vector<std::string>> rows) {
    for (auto& row : rows) {
        for (std::string& cell : row) cell = Orvix::Text::EscapeControls(cell);
    }
    std::vector<std::size_t> widths(rows.front().size(), 0);
    for (const auto& row : rows) {
        for (std::size_t i = 0; i < row.size(); ++i) widths[i] = std::max(widths[i], row[i].size());
    }
    for (const auto& row : rows) {
        std::string line;
        for (std::size_t i = 0; i + 1 < row.size(); ++i)
            line += row[i] + std::string(widths[i] - row[i].size() + 2, ' ');
        std::cout << line << row.back() << '\n';
    }
}

int FaultList(const Arguments&) {
    std::vector<std::vector<std::string>> rows = {{"ID", "OPERATION", "KEY", "REMAINING", "MESSAGE"}};
    for (const auto& fault : HostStore::Default().ListFaults()) {
        rows.push_back({std::to_string(fault.id), fault.operation, fault.key.empty() ? "-" : fault.key,
                        fault.remaining ? std::to_string(*fault.remaining) : "always", fault.message});
    }
    PrintTable(rows);
    return kOk;
}

int FaultClear(const Arguments&) {
    HostStore::Default().ClearFaults();
    return kOk;
}

int Graph(const Arguments&) {
    OrvixHostsim::WriteDot(OrvixHostsim::ReadTopology(HostStore::Default()), std::cout);
    return kOk;
}

int Path(const Arguments&) {
    std::cout << HostStore::ResolvePath() << '\n';
    return kOk;
}

const std::vector<Command>& Commands() {
    static const std::vector<Command> commands = {
        {"init",
         {},
         {{"profile", "FILE", false, "the profile to create the host from"},
          {"force", nullptr, false, "replace an existing store"}},
         "create the store from a profile",
         "Creates the store from FILE, else from $ORVIX_HOST_PROFILE, else from the embedded default host.\n"
         "An existing store is kept unless --force is given: then a good store is replaced by the profile\n"
         "and its faults are cleared, and a damaged one is replaced by a new one.",
         Init},
        {"dump",
         {},
         {},
         "print the whole host as a JSON profile",
         "Prints the whole host as a JSON profile, which `load` and `init --profile` accept.",
         Dump},
        {"load",
         {"FILE"},
         {},
         "replace the host by a profile",
         "Replaces the whole host by the profile in FILE, in one change; faults stay.\n"
         "A missing store is created.",
         Load},
        {"fault add",
         {"OPERATION"},
         {{"key", "KEY", false, "fire only for this object"},
          {"message", "TEXT", true, "the error message the operation fails with"},
          {"count", "N", false, "fire N times (N >= 1), then disappear; default: every time"}},
         "arm a fault",
         "Makes the library operation OPERATION (written Class::Operation) fail with TEXT.\n"
         "Prints the new fault's id.",
         FaultAdd},
        {"fault list",
         {},
         {},
         "list the armed faults",
         "Lists the armed faults, one a line: id, operation, key (\"-\" when none),\n"
         "remaining firings (\"always\" when unlimited) and message.",
         FaultList},
        {"fault clear", {}, {}, "remove every fault", "Removes every armed fault.", FaultClear},
        {"graph",
         {},
         {},
         "write the host's topology as a Graphviz graph",
         "Writes the host's network topology in Graphviz DOT: physical NICs, standard and distributed\n"
         "switches with their uplinks, port groups with their VLAN IDs, DV ports, kernel interfaces with\n"
         "their addresses and netstacks, and the ports of virtual machines. A reference to an object that\n"
         "does not exist is drawn dashed and marked \"missing\". To draw it: orvix-hostsim graph | dot -Tsvg",
         Graph},
        {"path", {}, {}, "print the store's path", "Prints the path of the store the other commands use.", Path},
    };
    return commands;
}

std::string Usage(const Option& option) {
    return std::string("--") + option.name + (option.value ? std::string(" ") + option.value : "");
}

std::string Synopsis(const Command& command) {
    std::string text = command.name;
    for (const char* operand : command.operands) text += std::string(" ") + operand;
    for (const auto& option : command.options)
        text += option.required ? " " + Usage(option) : " [" + Usage(option) + "]";
    return text;
}

void PrintHelp() {
    std::cout << "Usage: orvix-hostsim [--db PATH] COMMAND [ARGS]\n\n"
                 "Creates, shows and changes the store of a simulated host.\n\nCommands:\n";
    std::size_t width = 0;
    for (const auto& command : Commands()) width = std::max(width, Synopsis(command).size() + 2);
    for (const auto& command : Commands()) {
        std::string synopsis = Synopsis(command);
        synopsis.resize(width, ' ');
        std::cout << "  " << synopsis << command.summary << '\n';
    }
    std::cout << "\nOptions:\n"
                 "  --db PATH   the store to use, instead of $ORVIX_HOST_DB or\n"
#ifdef ORVIX_SYSTEM_HOST_DB
                 "              " ORVIX_SYSTEM_HOST_DB
                 "\n"
#else
                 "              ${XDG_STATE_HOME:-$HOME/.local/state}/orvix/host.db\n"
#endif
                 "  -h, --help  this help; COMMAND --help shows a command's help\n\n"
                 "Exit status: 0 done, 1 the request failed, 2 usage error, 3 the store cannot be used.\n";
}

void PrintHelp(const Command& command) {
    std::cout << "Usage: orvix-hostsim [--db PATH] " << Synopsis(command) << "\n\n" << command.description << '\n';
    if (command.options.empty()) return;
    std::cout << "\nOptions:\n";
    for (const auto& option : command.options) {
        std::string usage = Usage(option);
        usage.resize(std::max<std::size_t>(usage.size() + 2, 16), ' ');
        std::cout << "  " << usage << option.help << '\n';
    }
}

bool IsHelp(const std::string& arg) {
    return arg == "--help" || arg == "-h";
}

// Splits "--name=value" and "--name value"; returns the option's name and
// moves past its value.
std::string TakeOption(const std::vector<std::string>& args, std::size_t& i, std::string& value, bool takesValue) {
    std::string name = args[i].substr(2);
    const auto equals = name.find('=');
    if (equals != std::string::npos) {
        value = name.substr(equals + 1);
        name.erase(equals);
        if (!takesValue) throw UsageError("--" + name + " takes no value");
    } else if (takesValue) {
        if (i + 1 >= args.size()) throw UsageError("--" + name + " needs a value");
        value = args[++i];
    }
    return name;
}

const Option* FindOption(const Command& command, const std::string& arg) {
    const std::string name = arg.substr(2, arg.find('=') - 2);
    for (const auto& option : command.options) {
        if (name == option.name) return &option;
    }
    return nullptr;
}

// Reads a command's arguments; false when it showed the command's help instead.
bool ParseArguments(const Command& command, const std::vector<std::string>& args, std::size_t i, Arguments& parsed) {
    for (; i < args.size(); ++i) {
        const std::string& arg = args[i];
        if (IsHelp(arg)) {
            PrintHelp(command);
            return false;
        }
        if (arg.size() > 1 && arg[0] == '-') {
            const Option* option = arg.rfind("--", 0) == 0 ? FindOption(command, arg) : nullptr;
            if (!option) throw UsageError(std::string(command.name) + ": unknown option '" + arg + "'");
            std::string value;
            const std::string name = TakeOption(args, i, value, option->value != nullptr);
            if (!parsed.options.emplace(name, value).second) throw UsageError("--" + name + " given twice");
        } else {
            parsed.operands.push_back(arg);
        }
    }
    const std::string name = command.name;
    if (parsed.operands.size() < command.operands.size()) {
        throw UsageError(name + ": missing " + command.operands[parsed.operands.size()]);
    }
    if (parsed.operands.size() > command.operands.size()) {
        throw UsageError(name + ": unexpected argument '" + parsed.operands[command.operands.size()] + "'");
    }
    for (const auto& option : command.options) {
        if (option.required && !parsed.Has(option.name)) throw UsageError(name + ": --" + option.name + " is required");
    }
    return true;
}

// The command named at args[i] (one word or two); i moves past its name.
const Command& FindCommand(const std::vector<std::string>& args, std::size_t& i) {
    std::string choices;  // the second words of a group that args[i] names
    for (const auto& command : Commands()) {
        const std::string name = command.name;
        const auto blank = name.find(' ');
        if (name.substr(0, blank) != args[i]) continue;
        if (blank == std::string::npos) {
            i += 1;
            return command;
        }
        const std::string word = name.substr(blank + 1);
        if (i + 1 < args.size() && args[i + 1] == word) {
            i += 2;
            return command;
        }
        choices += (choices.empty() ? "" : ", ") + word;
    }
    if (choices.empty()) throw UsageError("unknown command '" + args[i] + "' (see orvix-hostsim --help)");
    throw UsageError(args[i] + ": expected one of " + choices);
}

int Run(const std::vector<std::string>& args) {
    std::size_t i = 0;
    while (i < args.size() && args[i].size() > 1 && args[i][0] == '-') {
        if (IsHelp(args[i])) {
            PrintHelp();
            return kOk;
        }
        if (args[i] != "--db" && args[i].rfind("--db=", 0) != 0) throw UsageError("unknown option '" + args[i] + "'");
        std::string db;
        TakeOption(args, i, db, true);
        if (db.empty()) throw UsageError("--db needs a value");
        // The library finds the store through the environment, so the
        // option and the variable cannot disagree.
        setenv("ORVIX_HOST_DB", db.c_str(), 1);
        ++i;
    }
    if (i == args.size()) throw UsageError("missing command (see orvix-hostsim --help)");
    const Command& command = FindCommand(args, i);
    Arguments parsed;
    if (!ParseArguments(command, args, i, parsed)) return kOk;
    return command.run(parsed);
}

// The exit status for a failure, from the one table of exit statuses.
int StatusOf(const std::exception& e) {
    if (dynamic_cast<const UsageError*>(&e) || dynamic_cast<const std::invalid_argument*>(&e)) return kUsage;
    if (dynamic_cast<const PldCtl::Store::ProfileError*>(&e) || dynamic_cast<const RequestError*>(&e)) return kFailed;
    return kUnusable;
}

}  // namespace

int main(int argc, char** argv) {
    int status = kOk;
    try {
        status = Run(std::vector<std::string>(argv + 1, argv + argc));
    } catch (const std::exception& e) {
        std::cerr << "orvix-hostsim: " << Orvix::Text::EscapeControls(e.what()) << '\n';
        return StatusOf(e);
    }
    std::cout.flush();
    if (!std::cout) {
        std::cerr << "orvix-hostsim: cannot write the output\n";
        return kFailed;
    }
    return status;
}
