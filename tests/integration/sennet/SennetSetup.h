#pragma once

// An installation of the generator in a temporary directory: its configuration, its inventory
// scripts and its resource properties, and the run of the real program on them.

#include <map>
#include <string>
#include <vector>

#include "support/FakeCimServer.h"
#include "support/LineEnds.h"
#include "support/RunProgram.h"
#include "support/TempDirectory.h"

class SennetSetup {
  public:
    /// Without scripts; the properties are empty and the output directories do not exist yet.
    SennetSetup();

    /// Writes an inventory script under this file name.
    void addScript(const std::string& fileName, const std::string& text) const;
    void setProperties(const std::string& text) const;
    /// Adds a line to the configuration file.
    void configure(const std::string& line);

    /// Runs the program to its end against a server, or, without one, with a socket that does not
    /// exist.
    support::ProgramResult run(const std::vector<std::string>& arguments,
                               const support::FakeCimServer& server) const;
    support::ProgramResult runWithoutServer(const std::vector<std::string>& arguments) const;

    /// The program's path and its whole environment, for a run in the background.
    static std::string program();
    std::map<std::string, std::string> environment(const std::string& socketPath) const;

    std::string scriptDirectory() const { return directory.path("scripts"); }
    std::string mifDirectory() const { return directory.path("mif"); }
    std::string sqlDirectory() const { return directory.path("sql"); }
    std::string path(const std::string& name) const { return directory.path(name); }
    std::string mifFile(const std::string& name) const { return mifDirectory() + "/" + name; }

    /// Puts a file of an earlier run into the MIF directory.
    void leaveMifFile(const std::string& name, const std::string& bytes) const;
    /// The names in the MIF directory, in byte order; empty when there is no such directory.
    std::vector<std::string> mifNames() const;

    /// What every run prints first.
    static std::string banner();
    /// The banner and the line that announces the default MIF directory.
    std::string start() const;

  private:
    support::TempDirectory directory;
    std::string configuration;
};

using support::crlf;
