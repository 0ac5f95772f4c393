// write-case CASE DIRECTORY: runs the generator with /QVE on the scripts and recorded server
// answers of a case folder, with DIRECTORY/mif and DIRECTORY/sql for its files.

#include <filesystem>
#include <iostream>
#include <string>

#include "integration/sennet/SennetSetup.h"
#include "support/FakeCimServer.h"
#include "support/Files.h"

namespace {

namespace fs = std::filesystem;

void answer(support::FakeCimServer& server, const fs::path& file) {
    // CLASS.class.xml or CLASS.instances.xml
    const std::string className = file.stem().stem().string();
    const support::Reply reply = support::Reply::ok(support::readFile(file));
    if (file.stem().extension() == ".class") {
        server.onGetClass(className, reply);
    } else {
        server.onEnumerateInstances(className, reply);
    }
}

int writeCase(const fs::path& folder, const std::string& directory) {
    const SennetSetup setup;
    support::FakeCimServer server;
    for (const auto& entry : fs::directory_iterator(folder / "scripts")) {
        setup.addScript(entry.path().filename(), support::readFile(entry.path()));
    }
    setup.setProperties(support::readFile(folder / "sennet.properties"));
    for (const auto& entry : fs::directory_iterator(folder / "server")) {
        answer(server, entry.path());
    }
    const support::ProgramResult result =
        setup.run({"/QVE", directory + "/mif", directory + "/sql"}, server);
    std::cout << result.out;
    std::cerr << result.err;
    return result.exitStatus;
}

}  // namespace

int main(int argc, char** argv) {
    if (argc != 3) {
        std::cerr << "usage: write-case CASE DIRECTORY\n";
        return 2;
    }
    try {
        return writeCase(argv[1], argv[2]);
    } catch (const std::exception& error) {
        std::cerr << error.what() << '\n';
        return 1;
    }
}
