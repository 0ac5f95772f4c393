#include "CommandLine.h"

#include <Pegasus/Common/Exception.h>
#include <unistd.h>

#include <CLI/CLI.hpp>
#include <exception>
#include <functional>
#include <iostream>
#include <memory>
#include <string>

#include "cim/CimText.h"
#include "report/Output.h"
#include "report/Text.h"
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

int runCommand(const Choice& choice) {
    const Output output{std::cout, std::cerr, choice.json, ::isatty(STDOUT_FILENO) == 1,
                        ::isatty(STDERR_FILENO) == 1};
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
        "  sennetctl server\n"
        "  sennetctl get CIM_Processor\n\n"
        "The exit status is 0 when all is fine, 1 when something was found, and 2 when the "
        "command\n"
        "could not do its work. 'sennetctl COMMAND --help' tells more about a command.");
    addServer(app, choice);
    addGet(app, choice);
    try {
        app.parse(argc, argv);
    } catch (const CLI::ParseError& error) {
        return app.exit(error) == 0 ? kFine : kCannotRun;
    }
    return runCommand(choice);
}

}  // namespace sennetctl
