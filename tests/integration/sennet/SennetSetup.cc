#include "integration/sennet/SennetSetup.h"

#include <filesystem>

#include "support/Files.h"

namespace {

constexpr const char* kConfigurationFile = "velm.properties";
constexpr const char* kResourceFile = "sennet.properties";

}  // namespace

SennetSetup::SennetSetup() {
    std::filesystem::create_directory(scriptDirectory());
    setProperties("");
    configure("sennet.directory=" + scriptDirectory());
    configure("sennet.resources=" + path(kResourceFile));
    configure("mif.directory=" + mifDirectory());
    configure("sql.directory=" + sqlDirectory());
}

void SennetSetup::addScript(const std::string& fileName, const std::string& text) const {
    support::writeFile(scriptDirectory() + "/" + fileName, text);
}

void SennetSetup::setProperties(const std::string& text) const {
    support::writeFile(path(kResourceFile), text);
}

void SennetSetup::configure(const std::string& line) {
    configuration += line + "\n";
    support::writeFile(path(kConfigurationFile), configuration);
}

support::ProgramResult SennetSetup::run(const std::vector<std::string>& arguments,
                                        const support::FakeCimServer& server) const {
    return support::runProgram(program(), arguments, environment(server.socketPath()));
}

support::ProgramResult SennetSetup::runWithoutServer(
    const std::vector<std::string>& arguments) const {
    return support::runProgram(program(), arguments, environment(path("no.socket")));
}

std::string SennetSetup::program() {
    return TEST_BIN_DIR "/sennet";
}

std::map<std::string, std::string> SennetSetup::environment(const std::string& socketPath) const {
    return {{"VELM_CONFIG", path(kConfigurationFile)},
            {"CIM_LOCAL_SOCKET", socketPath},
            {"CIM_EMBEDDED", "never"}};
}

void SennetSetup::leaveMifFile(const std::string& name, const std::string& bytes) const {
    std::filesystem::create_directories(mifDirectory());
    support::writeFile(mifFile(name), bytes);
}

std::vector<std::string> SennetSetup::mifNames() const {
    return support::namesIn(mifDirectory());
}

std::string SennetSetup::banner() {
    return "Corvane CIM to MIF Generator, version 5.20\n\n";
}

std::string SennetSetup::start() const {
    return banner() + "Creating MIF files in " + mifDirectory() + "\n";
}
