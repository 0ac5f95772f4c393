#include "CommandLine.h"

#include <Pegasus/Common/Exception.h>

#include <CLI/CLI.hpp>
#include <algorithm>
#include <exception>
#include <functional>
#include <iostream>
#include <memory>
#include <new>
#include <string>
#include <utility>
#include <vector>

#include "cim/CimText.h"
#include "html/HtmlCommand.h"
#include "mif/MifCommands.h"
#include "report/CannotRun.h"
#include "report/Output.h"
#include "report/StandardStreams.h"
#include "script/CheckCommand.h"
#include "script/NewCommand.h"
#include "server/GetCommand.h"
#include "server/ServerCommand.h"

#ifndef SENNETCTL_VERSION
#error "SENNETCTL_VERSION must be defined"
#endif

namespace sennetctl {
namespace {

/// What the command line chose.
struct Choice {
    bool json = false;
    std::function<int(const Output&)> command;
};

CLI::App* addCommand(CLI::App& parent, Choice& choice, const std::string& name,
                     const std::string& description, const std::string& examples) {
    CLI::App* command = parent.add_subcommand(name, description);
    command->footer("Examples:\n" + examples);
    command->add_flag("--json", choice.json, "print one JSON document");
    return command;
}

void addTimeout(CLI::App& command, unsigned& seconds,
                const std::string& whatFor = "how long the server's first answer may take") {
    command.add_option("--timeout", seconds, whatFor + ", by default 10 s")
        ->option_text("SECONDS")
        ->check(CLI::Range(1, 3600));
}

void addServer(CLI::App& app, Choice& choice) {
    CLI::App* command = addCommand(
        app, choice, "server", "Tell which CIM server sennet reaches and why, and what it has.",
        "  sennetctl server\n"
        "  sennetctl server --classes -n root/mycompany\n"
        "  CIM_LOCAL_SOCKET=/run/cimomd/cimxml.socket sennetctl server --json");
    const auto options = std::make_shared<ServerOptions>();
    command->add_option("-n,--namespace", options->namespaces, "look for this namespace, too")
        ->option_text("NAMESPACE");
    command->add_flag("--classes", options->listClasses, "list the names of the classes");
    addTimeout(*command, options->timeoutSeconds, "how long each answer may take");
    command->callback([&choice, options] {
        choice.command = [options](const Output& output) { return showServer(*options, output); };
    });
}

void addGet(CLI::App& app, Choice& choice) {
    CLI::App* command = addCommand(app, choice, "get", "Show the instances of a class as a table.",
                                   "  sennetctl get CIM_Processor\n"
                                   "  sennetctl get CIM_DiskDrive -p DeviceID,MaxMediaSize\n"
                                   "  sennetctl get CIM_Fan -n root/cimv2 --json");
    const auto options = std::make_shared<GetOptions>();
    command->add_option("CLASS", options->className, "name of the class")
        ->option_text(" ")
        ->required();
    command
        ->add_option("-n,--namespace", options->nameSpace,
                     "namespace of the class, by default root/cimv2")
        ->option_text("NAMESPACE");
    command
        ->add_option("-p,--properties", options->properties,
                     "these properties, in this order; by default all that have a value")
        ->option_text("PROPERTY,...")
        ->delimiter(',');
    addTimeout(*command, options->timeoutSeconds);
    command->callback([&choice, options] {
        choice.command = [options](const Output& output) {
            return showInstances(*options, output);
        };
    });
}

void addCheck(CLI::App& app, Choice& choice) {
    CLI::App* command = addCommand(
        app, choice, "check",
        "Tell what sennet will make of inventory scripts, and where it will stay silent.",
        "  sennetctl check\n"
        "  sennetctl check --translations\n"
        "  sennetctl check --offline own.script.inv");
    const auto options = std::make_shared<CheckOptions>();
    command
        ->add_option("SCRIPT", options->scripts,
                     "inventory scripts; by default all that sennet reads")
        ->option_text("...");
    command->add_flag("--offline", options->offline, "ask no CIM server");
    addTimeout(*command, options->timeoutSeconds);
    command->add_flag("--translations", options->translations,
                      "tell names and sizes that the resource properties lack, too");
    command->add_flag("-v,--verbose", options->verbose,
                      "tell which configuration, directory and resource properties are used, too");
    command->callback([&choice, options] {
        choice.command = [options](const Output& output) { return checkScripts(*options, output); };
    });
}

void addNew(CLI::App& app, Choice& choice) {
    CLI::App* command = addCommand(
        app, choice, "new", "Write a first inventory script for classes of the CIM server.",
        "  sennetctl new fans.script.inv --class CIM_Fan\n"
        "  sennetctl new own.script.inv --class OWN_Order --class OWN_Item -n root/own "
        "--title Orders");
    const auto options = std::make_shared<NewOptions>();
    command->add_option("SCRIPT", options->script, "the file, whose name ends in .script.inv")
        ->option_text(" ")
        ->required();
    command->add_option("--class", options->classes, "a class; at most ten of them")
        ->option_text("CLASS")
        ->required();
    command
        ->add_option("-n,--namespace", options->nameSpace,
                     "namespace of the classes, by default root/cimv2")
        ->option_text("NAMESPACE");
    command->add_option("--title", options->title, "by default made of the file's name")
        ->option_text("TITLE");
    addTimeout(*command, options->timeoutSeconds);
    command->callback([&choice, options] {
        choice.command = [options](const Output& output) {
            return writeNewScript(*options, output);
        };
    });
}

void addMifCheck(CLI::App& mif, Choice& choice) {
    CLI::App* command =
        addCommand(mif, choice, "check", "Check MIF files as a product that imports them does.",
                   "  sennetctl mif check --profile sms out/*.mif\n"
                   "  sennetctl mif check --profile sms --max-kb 1024 yesterday.mif today.mif\n"
                   "  sennetctl mif check kwvinv.mif --json");
    struct Options {
        LintOptions lint;
        std::string profile = "dmi";
        std::vector<std::string> files;
    };
    const auto options = std::make_shared<Options>();
    command
        ->add_option("--profile", options->profile,
                     "whose rules: dmi (the standard, which is the default), sms, ca or landesk")
        ->option_text("PROFILE")
        ->check(CLI::IsMember({"dmi", "sms", "ca", "landesk"}));
    command
        ->add_option("--max-kb", options->lint.largestKilobytes,
                     "the size that the site takes, by default 250 KB; for sms only")
        ->option_text("KB")
        ->check(CLI::Range(1, 5120));
    command
        ->add_option("FILE", options->files,
                     "the files in the order in which they are imported; a later one is compared "
                     "with the classes of the earlier ones")
        ->option_text("...")
        ->required();
    command->callback([&choice, options, command] {
        options->lint.profile = parseMifProfile(options->profile).value_or(MifProfile::Dmi);
        if (command->count("--max-kb") > 0 && options->lint.profile != MifProfile::Sms) {
            throw CLI::ValidationError("--max-kb", "only --profile sms has a largest size");
        }
        choice.command = [options](const Output& output) {
            return checkMifFiles(options->files, options->lint, output);
        };
    });
}

void addMifShow(CLI::App& mif, Choice& choice) {
    const auto file = std::make_shared<std::string>();
    CLI::App* show = addCommand(mif, choice, "show", "Show the tables of a MIF file.",
                                "  sennetctl mif show out/processor.mif");
    show->add_option("FILE", *file, "the file")->option_text(" ")->required();
    show->callback([&choice, file] {
        choice.command = [file](const Output& output) { return showMifFile(*file, output); };
    });
    CLI::App* json = addCommand(mif, choice, "json", "Print the tables of a MIF file as JSON.",
                                "  sennetctl mif json out/processor.mif | jq '.tables[].rows'");
    json->add_option("FILE", *file, "the file")->option_text(" ")->required();
    json->callback([&choice, file] {
        choice.json = true;
        choice.command = [file](const Output& output) { return showMifFile(*file, output); };
    });
}

void addMifDiff(CLI::App& mif, Choice& choice) {
    const auto files = std::make_shared<std::pair<std::string, std::string>>();
    CLI::App* command =
        addCommand(mif, choice, "diff", "Tell what changed in the inventory.",
                   "  sennetctl mif diff yesterday/diskdrive.mif out/diskdrive.mif");
    command->add_option("OLD", files->first, "the earlier file")->option_text(" ")->required();
    command->add_option("NEW", files->second, "the later file")->option_text(" ")->required();
    command->callback([&choice, files] {
        choice.command = [files](const Output& output) {
            return compareMifFiles(files->first, files->second, output);
        };
    });
}

void addMifHtml(CLI::App& mif, Choice& choice) {
    CLI::App* command = addCommand(mif, choice, "html", "Write a page that shows MIF files.",
                                   "  sennetctl mif html out/*.mif -o page\n"
                                   "  sennetctl mif html out/*.mif -o page --title \"$(hostname)\" "
                                   "--force");
    const auto options = std::make_shared<HtmlOptions>();
    command->add_option("FILE", options->files, "the files, in the order of the page")
        ->option_text("...")
        ->required();
    command
        ->add_option("-o,--output", options->directory,
                     "where inventory.html goes; made if it is missing")
        ->option_text("DIR")
        ->required();
    command->add_option("--title", options->title, "what the page is called, by default Inventory")
        ->option_text("TITLE");
    command->add_flag("--force", options->replace, "replace the page of an earlier run");
    command->callback([&choice, options] {
        choice.command = [options](const Output& output) {
            return writeHtmlPage(*options, output);
        };
    });
}

void addMif(CLI::App& app, Choice& choice) {
    CLI::App* mif = app.add_subcommand("mif", "Check, show and compare MIF files.");
    mif->require_subcommand(1);
    mif->footer(
        "Examples:\n"
        "  sennetctl mif check --profile sms out/*.mif\n"
        "  sennetctl mif show out/processor.mif\n"
        "  sennetctl mif html out/*.mif -o page");
    addMifCheck(*mif, choice);
    addMifShow(*mif, choice);
    addMifDiff(*mif, choice);
    addMifHtml(*mif, choice);
}

/// The names of the commands on the level of the one that lacks its own: "check, get or mif".
std::string expectedCommands(const CLI::App& app) {
    const std::vector<CLI::App*> chosen = app.get_subcommands();
    const CLI::App& level = chosen.empty() ? app : *chosen.front();
    const std::vector<const CLI::App*> commands = level.get_subcommands({});
    std::string names;
    for (const CLI::App* command : commands) {
        const char* separator = command == commands.back() ? " or " : ", ";
        names += (names.empty() ? "" : separator) + command->get_name();
    }
    return names;
}

/// CLI11 only says that a command is missing.
std::string parsingFailure(const CLI::ParseError& error, const CLI::App& app) {
    if (std::string(error.what()) != "A subcommand is required") {
        return error.what();
    }
    const std::vector<std::string> words = app.remaining(true);
    const std::string expected = ": expected " + expectedCommands(app);
    if (words.empty()) {
        return "a command is missing" + expected;
    }
    const auto command = std::find_if(words.begin(), words.end(), [](const std::string& word) {
        return word.rfind('-', 0) != 0;
    });
    return command == words.end() ? "'" + words.front() + "' is no option here" + expected
                                  : "'" + *command + "' is no command" + expected;
}

/// What the command line asks for, wrong as it may be.
bool asksForJson(const std::vector<std::string>& arguments) {
    const bool printsJson = arguments.size() > 1 && arguments[0] == "mif" && arguments[1] == "json";
    return printsJson || std::find(arguments.begin(), arguments.end(), "--json") != arguments.end();
}

/// Help and the version, too, come as an exception.
int endParsing(const CLI::ParseError& error, const CLI::App& app, const Output& output) {
    if (error.get_exit_code() == 0) {
        return app.exit(error, output.out, output.err);
    }
    printFailure({{}, 0, 0, parsingFailure(error, app)}, output);
    output.err << "Run with --help for more information.\n";
    return kCannotRun;
}

int runCommand(const Choice& choice, const Output& output) {
    try {
        return choice.command(output);
    } catch (const CannotRun& cause) {
        printFailure(cause.failure(), output);
    } catch (const Pegasus::Exception& error) {
        printFailure({{}, 0, 0, reasonOf(error)}, output);
    } catch (const std::bad_alloc&) {
        printFailure({{}, 0, 0, "not enough memory"}, output);
    } catch (const std::exception& error) {
        printFailure({{}, 0, 0, error.what()}, output);
    }
    return kCannotRun;
}

void addCommands(CLI::App& app, Choice& choice) {
    addCheck(app, choice);
    addServer(app, choice);
    addGet(app, choice);
    addMif(app, choice);
    addNew(app, choice);
}

int parseAndRun(int argc, char** argv, StandardStreams& streams) {
    Choice choice;
    CLI::App app("What an administrator needs around sennet, the generator of MIF files.",
                 "sennetctl");
    app.set_version_flag("--version", std::string("sennetctl ") + SENNETCTL_VERSION);
    app.require_subcommand(1);
    app.footer(
        "Examples:\n"
        "  sennetctl check\n"
        "  sennetctl server\n"
        "  sennetctl get CIM_Processor\n"
        "  sennetctl mif check --profile sms out/*.mif\n\n"
        "The exit status is 0 when all is fine, 1 when something was found, and 2 when the "
        "command\n"
        "could not do its work. 'sennetctl COMMAND --help' tells more about a command.");
    addCommands(app, choice);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return endParsing(error, app, streams.output(asksForJson({argv + 1, argv + argc})));
    }
    return runCommand(choice, streams.output(choice.json));
}

}  // namespace

int runCommandLine(int argc, char** argv) {
    StandardStreams streams;
    const int status = parseAndRun(argc, argv, streams);
    const std::string trouble = streams.flush();
    if (!trouble.empty()) {
        std::cerr << "sennetctl: " << trouble << '\n';
        return kCannotRun;
    }
    return status;
}

}  // namespace sennetctl
