#include "CommandLine.h"

#include <Pegasus/Common/Exception.h>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <cstdlib>
#include <exception>
#include <functional>
#include <iostream>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "cim/CimText.h"
#include "html/HtmlCommand.h"
#include "mif/MifCommands.h"
#include "report/Output.h"
#include "report/Text.h"
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

void addTimeout(CLI::App& command, unsigned& seconds, const std::string& whatFor) {
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
    command->add_option("CLASS", options->className, "name of the class")->required();
    command
        ->add_option("-n,--namespace", options->nameSpace,
                     "namespace of the class, by default root/cimv2")
        ->option_text("NAMESPACE");
    command
        ->add_option("-p,--properties", options->properties,
                     "these properties, in this order; by default all that have a value")
        ->option_text("PROPERTY,...")
        ->delimiter(',');
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
        ->option_text("SCRIPT...");
    command->add_flag("--offline", options->offline, "ask no CIM server");
    addTimeout(*command, options->timeoutSeconds, "how long the server's first answer may take");
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
        ->option_text("SCRIPT")
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
                     "the size that the site takes, by default 250 KB")
        ->option_text("KB")
        ->check(CLI::Range(1, 5120));
    command
        ->add_option("FILE", options->files,
                     "the files in the order in which they are imported; a later one is compared "
                     "with the classes of the earlier ones")
        ->option_text("FILE...")
        ->required();
    command->callback([&choice, options] {
        options->lint.profile = parseMifProfile(options->profile).value_or(MifProfile::Dmi);
        choice.command = [options](const Output& output) {
            return checkMifFiles(options->files, options->lint, output);
        };
    });
}

void addMifShow(CLI::App& mif, Choice& choice) {
    const auto file = std::make_shared<std::string>();
    CLI::App* show = addCommand(mif, choice, "show", "Show the tables of a MIF file.",
                                "  sennetctl mif show out/processor.mif");
    show->add_option("FILE", *file, "the file")->option_text("FILE")->required();
    show->callback([&choice, file] {
        choice.command = [file](const Output& output) { return showMifFile(*file, output); };
    });
    CLI::App* json = addCommand(mif, choice, "json", "Print the tables of a MIF file as JSON.",
                                "  sennetctl mif json out/processor.mif | jq '.tables[].rows'");
    json->add_option("FILE", *file, "the file")->option_text("FILE")->required();
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
    command->add_option("OLD", files->first, "the earlier file")->option_text("OLD")->required();
    command->add_option("NEW", files->second, "the later file")->option_text("NEW")->required();
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
        ->option_text("FILE...")
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

/// Whether there is a terminal that moves its cursor and shows colours.
bool takesEscapes(int descriptor) {
    const char* kind = std::getenv("TERM");
    return ::isatty(descriptor) == 1 && (kind == nullptr || std::string_view(kind) != "dumb");
}

/// As https://no-color.org has it: any value but the empty one refuses colours.
bool wantsColour() {
    const char* refused = std::getenv("NO_COLOR");
    return takesEscapes(STDOUT_FILENO) && (refused == nullptr || *refused == '\0');
}

int runCommand(const Choice& choice) {
    const Output output{std::cout, std::cerr, choice.json, wantsColour(),
                        takesEscapes(STDERR_FILENO)};
    std::string failure;
    try {
        const int status = choice.command(output);
        if (std::cout.flush()) {
            return status;
        }
        failure = "standard output cannot be written";
    } catch (const Pegasus::Exception& error) {
        failure = reasonOf(error);
    } catch (const std::exception& error) {
        failure = error.what();
    }
    std::cerr << "sennetctl: " << printable(failure) << '\n';
    return kCannotRun;
}

}  // namespace

int runCommandLine(int argc, char** argv) {
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
    addCheck(app, choice);
    addServer(app, choice);
    addGet(app, choice);
    addMif(app, choice);
    addNew(app, choice);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return app.exit(error) == 0 ? kFine : kCannotRun;
    }
    return runCommand(choice);
}

}  // namespace sennetctl
