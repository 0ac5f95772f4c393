#pragma once

// Runs of the real program on an installation of its own: every MIF file that a run leaves behind,
// be it killed or not, has to be one that an importer can read.

#include <gtest/gtest.h>

#include <map>
#include <string>
#include <vector>

#include "integration/sennet/BackgroundProgram.h"
#include "integration/sennet/SennetSetup.h"
#include "support/FakeCimServer.h"
#include "support/RunProgram.h"

class MifFileFixture : public ::testing::Test {
  protected:
    /// Runs the program to its end for a product, such as "/SMS", and reads its files.
    support::ProgramResult run(const std::string& product);

    /// Starts the program for a product; the files are read at the end of the test.
    BackgroundProgram start(const std::string& product);

    /// Reads the files of the program that ran last.
    void expectReadableFiles();

    /// Puts a file of an earlier run into the MIF directory. It is not read while it holds this.
    void leaveMifFile(const std::string& name, const std::string& bytes);

    /// The file of this name is broken in this test, and refused with exactly this:
    /// "line:column: message".
    void expectUnreadable(const std::string& name, const std::string& refusal);

    void TearDown() override;

    SennetSetup setup;
    support::FakeCimServer server;

  private:
    std::string lastProduct;
    std::map<std::string, std::string> leftFiles;
    std::map<std::string, std::string> refusals;
};
