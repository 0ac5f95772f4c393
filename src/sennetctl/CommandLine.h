#pragma once

namespace sennetctl {

/// The whole program: main's arguments, its exit status.
int runCommandLine(int argc, char** argv);

}  // namespace sennetctl
