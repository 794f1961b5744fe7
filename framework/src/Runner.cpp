// One run of the CLI: resolve the command path, handle the options every
// command understands (--help, --formatter, --version), parse and check the
// command's own arguments, execute, render, and map the outcome to an exit
// status. This is the only place that decides exit statuses.
#include <algorithm>
#include <memory>
#include <sstream>
#include <streambuf>
#include <utility>

#include "format/Common.h"
#include "framework/Format.h"
#include "framework/Runner.h"

namespace AutoCli {

namespace {

using Formatting::EscapeControls;

struct CommandLine {
    std::vector<std::string> pathWords;
    boost::shared_ptr<CallSpec::InputSpec> parameters;  // of the command, once the path reaches one
    std::vector<std::string> commandArgs;
    boost::shared_ptr<NamespaceNode> node;
    std::string formatter;
    bool help = false;
    bool version = false;
};

std::string JoinPath(const std::vector<std::string>& words) {
    return JoinNames(words, " ");
}

bool IsOption(const std::string& token) {
    return !token.empty() && token[0] == '-';
}

// The names of the options every namespace understands, long and short, for
// suggestions: the global options but those taken only before the path.
std::pair<std::vector<std::string>, std::vector<std::string>> GlobalOptionNames() {
    std::pair<std::vector<std::string>, std::vector<std::string>> names;
    for (const GlobalOption& option : GlobalOptions()) {
        if (option.leadingOnly) continue;
        names.first.push_back(option.longName);
        if (!option.shortName.empty()) names.second.push_back(option.shortName);
    }
    return names;
}

std::string FormatterList() {
    return JoinNames(FormatterNames());
}

// Walks the tree along the leading words, collecting the global options met
// on the way and after the command. Throws UsageError.
CommandLine Resolve(const boost::shared_ptr<NamespaceNode>& root, const std::vector<std::string>& args) {
    CommandLine line;
    line.node = root;
    bool formatterGiven = false;
    for (std::size_t i = 0; i < args.size(); ++i) {
        const std::string& token = args[i];
        Command* command = line.node->AsCommand();
        // A command may declare options of these names; then they are its own.
        auto own = [&](const std::string& name, const std::string& letter) {
            return line.parameters &&
                   (line.parameters->FindByName(name) || (!letter.empty() && line.parameters->FindByShortName(letter)));
        };
        if ((token == "--help" && !own("help", "")) || (token == "-h" && !own("", "h"))) {
            line.help = true;
        } else if (token == "--version" && !command) {
            line.version = true;
        } else if (token.compare(0, 11, "--formatter") == 0 && (token.size() == 11 || token[11] == '=') &&
                   !own("formatter", "")) {
            if (formatterGiven) throw UsageError("Option --formatter is given more than once");
            formatterGiven = true;
            if (token.size() > 11) {
                line.formatter = token.substr(12);
            } else if (i + 1 < args.size() && !IsOption(args[i + 1])) {
                // "--formatter network ip get" forgot the name; taking the
                // command word for it would only confuse what follows.
                const std::string& next = args[i + 1];
                if (!FindFormatter(next) && line.node->FindChild(next)) {
                    throw UsageError("Option --formatter needs a value before the command word '" + next +
                                     "': one of " + FormatterList());
                }
                line.formatter = args[++i];
            }
            // An empty name would otherwise pass as "no formatter chosen" and
            // print in the default format a script did not ask for.
            if (line.formatter.empty()) {
                throw UsageError("Option --formatter needs a value: one of " + FormatterList());
            }
        } else if (command) {
            line.commandArgs.push_back(token);
        } else if (IsOption(token)) {
            if (line.help) continue;
            std::string message = "Unknown option " + token +
                                  (line.pathWords.empty() ? std::string() : " for '" + JoinPath(line.pathWords) + "'");
            const auto [longNames, shortNames] = GlobalOptionNames();
            const std::string suggestion = SuggestOption(token, longNames, shortNames);
            if (!suggestion.empty()) message += ". Did you mean " + suggestion + "?";
            throw UsageError(message);
        } else {
            boost::shared_ptr<NamespaceNode> child = line.node->FindChild(token);
            if (!child) {
                std::vector<std::string> names;
                for (const auto& c : line.node->GetChildren()) names.push_back(c.first);
                std::string message = "Unknown command or namespace '" + token + "'";
                if (!line.pathWords.empty()) message += " in '" + JoinPath(line.pathWords) + "'";
                std::string suggestion = SuggestClosest(token, names);
                if (!suggestion.empty()) message += ". Did you mean '" + suggestion + "'?";
                throw UsageError(message);
            }
            line.pathWords.push_back(token);
            line.node = child;
            if (Command* reached = child->AsCommand()) line.parameters = reached->GetInputSpec();
        }
    }
    if (!line.formatter.empty() && !FindFormatter(line.formatter)) {
        std::string message = "Unknown formatter '" + line.formatter + "'";
        std::string suggestion = SuggestClosest(line.formatter, FormatterNames());
        message += suggestion.empty() ? "." : ". Did you mean '" + suggestion + "'?";
        throw UsageError(message + " Formatters: " + FormatterList() + ".");
    }
    return line;
}

// An output buffer that grows by whole chunks and never moves what it holds:
// a listing renders to hundreds of kilobytes, which a single growing string
// would copy each time it doubled. Chunks start small, for the many commands
// that print a few lines, and double up to a limit.
class ChunkBuffer : public std::streambuf {
public:
    ChunkBuffer() { NewChunk(); }

    // Writes what was rendered; nothing for an empty rendering, which would
    // otherwise mark `out` as failed.
    void WriteTo(std::ostream& out) {
        chunks_.back().used = static_cast<std::size_t>(pptr() - pbase());
        for (const Chunk& chunk : chunks_) {
            if (chunk.used > 0) out.write(chunk.text.get(), static_cast<std::streamsize>(chunk.used));
        }
    }

protected:
    int_type overflow(int_type c) override {
        if (traits_type::eq_int_type(c, traits_type::eof())) return traits_type::not_eof(c);
        NewChunk();
        *pptr() = traits_type::to_char_type(c);
        pbump(1);
        return c;
    }

    std::streamsize xsputn(const char* text, std::streamsize count) override {
        std::streamsize written = 0;
        while (written < count) {
            if (pptr() == epptr()) NewChunk();
            const std::streamsize room = std::min<std::streamsize>(epptr() - pptr(), count - written);
            traits_type::copy(pptr(), text + written, static_cast<std::size_t>(room));
            pbump(static_cast<int>(room));
            written += room;
        }
        return written;
    }

private:
    static constexpr std::size_t kFirstChunkSize = 4 * 1024;
    static constexpr std::size_t kLargestChunkSize = 256 * 1024;

    struct Chunk {
        // Left uninitialised: a page is touched only when text reaches it.
        std::unique_ptr<char[]> text;
        std::size_t used = 0;
    };

    void NewChunk() {
        std::size_t size = kFirstChunkSize;
        if (!chunks_.empty()) {
            chunks_.back().used = static_cast<std::size_t>(pptr() - pbase());
            size = std::min(kLargestChunkSize, 2 * static_cast<std::size_t>(epptr() - pbase()));
        }
        chunks_.push_back(Chunk{std::unique_ptr<char[]>(new char[size]), 0});
        char* begin = chunks_.back().text.get();
        setp(begin, begin + size);
    }

    std::vector<Chunk> chunks_;
};

int Execute(Command& command, const CommandLine& line, std::ostream& out, std::ostream& err,
            const RunOptions& options) {
    const std::string path = JoinPath(line.pathWords);
    boost::shared_ptr<CallSpec::Input> input;
    try {
        input = ParseArguments(*line.parameters, line.commandArgs);
    } catch (const UsageError& e) {
        err << options.program << ": " << EscapeControls(e.what()) << "\n"
            << "Run '" << options.program << " " << path << " --help' for its options.\n";
        return kExitUsage;
    }

    boost::shared_ptr<CallSpec::OutputSpec> outputSpec = command.GetOutputSpec();
    boost::shared_ptr<CallSpec::Output> output = CallSpec::Output::New();
    command.Execute(input, output);

    // A result that does not match the declared output, or one never
    // completed, is a fault of the command; nothing of it is shown.
    const auto& result = output->GetResult();
    if (result && !output->IsComplete()) {
        err << options.program << ": internal error: '" << path << "' set a result without completing\n";
        return kExitFailure;
    }
    const auto& declared = outputSpec ? outputSpec->GetTemplate() : MetaObj::MetaObjectPtr();
    if (result && declared && declared->GetType() != result->GetType()) {
        err << options.program << ": internal error: '" << path << "' returned a "
            << MetaObj::MetaTypeName(result->GetType()) << " but declares a "
            << MetaObj::MetaTypeName(declared->GetType()) << "\n";
        return kExitFailure;
    }
    if (result) {
        std::string name = line.formatter;
        if (name.empty()) name = command.GetDefaultOutputFormatter();
        if (name.empty()) name = "simple";
        const Formatter* formatter = FindFormatter(name);
        if (!formatter) {
            err << options.program << ": internal error: '" << path << "' names an unknown formatter '" << name
                << "'\n";
            return kExitFailure;
        }
        // Rendered to a buffer first, so a formatter failure never leaves
        // half a document on stdout.
        ChunkBuffer buffer;
        std::ostream rendered(&buffer);
        formatter->Render(result, FormatHints(command.GetDefaultOutputParameters()), rendered);
        buffer.WriteTo(out);
    }
    for (const auto& message : output->GetErrors()) err << EscapeControls(message) << "\n";
    if (options.exitsAfterRun) {
        // Still reachable through this list when the process ends, so leak
        // checkers do not count it as lost.
        static auto* const kLeftStanding = new std::vector<boost::shared_ptr<CallSpec::Output>>();
        kLeftStanding->push_back(output);
    }
    return output->HasError() ? kExitCommandError : kExitOk;
}

}  // namespace

int Run(const boost::shared_ptr<NamespaceNode>& root, const std::vector<std::string>& args, std::ostream& out,
        std::ostream& err, const RunOptions& options) {
    try {
        CommandLine line;
        try {
            line = Resolve(root, args);
        } catch (const UsageError& e) {
            err << options.program << ": " << EscapeControls(e.what()) << "\n";
            return kExitUsage;
        }
        const std::string path = JoinPath(line.pathWords);
        if (line.version) {
            out << options.program << " " << options.version << "\n";
            return kExitOk;
        }
        Command* command = line.node->AsCommand();
        if (line.help) {
            if (command) {
                RenderCommandHelp(*command, options.program, path, out);
            } else {
                RenderNamespaceHelp(*line.node, options.program, path, out);
            }
            return kExitOk;
        }
        if (!command) {
            if (!line.pathWords.empty()) {
                err << options.program << ": '" << path << "' is a namespace; give one of its commands\n\n";
            }
            RenderNamespaceHelp(*line.node, options.program, path, err);
            return kExitUsage;
        }
        return Execute(*command, line, out, err, options);
    } catch (const std::exception& e) {
        err << options.program << ": " << EscapeControls(e.what()) << "\n";
        return kExitFailure;
    } catch (...) {
        err << options.program << ": internal error: unknown exception\n";
        return kExitFailure;
    }
}

}  // namespace AutoCli
