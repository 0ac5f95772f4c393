// Catches what the code under test sends to the system log: this program's own syslog function
// stands before the C library's.
#pragma once

#include <string>
#include <vector>

struct SyslogEntry {
    int priority;
    std::string text;
};

// Everything logged since the program's start or the last call; forgets it.
std::vector<SyslogEntry> takeSyslog();
