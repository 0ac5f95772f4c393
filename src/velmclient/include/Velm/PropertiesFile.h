// Reader of key/value files in UTF-8.
//
// A line is `key=value` or `key: value`: the first `=` or `:` that no backslash stands before
// separates, blanks (space, tab) around the key and before the value are dropped, blanks at the end
// of the value are kept. A line without a separator is a key with an empty value. LF, CR LF or CR
// ends a line. A line whose first character other than a blank is `#` or `!` is a comment. A line
// that ends in an odd number of backslashes continues in the next one, whose leading blanks are
// dropped. Escapes are \t \n \r \\ \uXXXX (a surrogate pair is one character, an unpaired surrogate
// becomes U+FFFD) and a backslash before space, tab, `=` or `:`; what looks like any other escape
// is kept as written. The last of equal keys wins. A byte-order mark at the start is skipped.
//
// Keys and values are always well-formed UTF-8: each byte of the file that is not part of such a
// character reads as U+FFFD.
#pragma once

#include <string>

#include "Velm/Properties.h"

namespace Velm {

class PropertiesFile {
  public:
    // Remembers the path (copied); nothing is read yet. A null path is that of no file.
    explicit PropertiesFile(const char* path);

    // Reads the file in place of what was loaded before, and returns whether it could be read. A
    // file that is missing, unreadable, no regular file or larger than 16 MiB gives an empty set;
    // each but the missing one is reported to the system log. Never throws for the file's sake.
    bool load();

    // What the last load read; empty before it. Owned by this object.
    const Properties& getProperties() const;

  private:
    std::string path;
    Properties properties;
};

}  // namespace Velm
