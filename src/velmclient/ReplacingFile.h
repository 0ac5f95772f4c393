// A file that takes the place of another one only when it is complete. Its bytes go into a
// temporary file of the same directory, one without a name where the file system knows such, else
// one with a hidden name; commit renames it. So no reader sees a half-written file, and a process
// that is killed leaves the previous file whole. Failures are reported to the system log, and errno
// has the cause of the first one when it is reported.
#pragma once

#include <optional>
#include <string>
#include <string_view>

#include "velmclient/FileDescriptor.h"

namespace Velm {

class ReplacingFile {
  public:
    enum class Temporary { kNamelessWherePossible, kHidden };

    // Remembers the path to be replaced; nothing is opened.
    explicit ReplacingFile(std::string path,
                           Temporary temporary = Temporary::kNamelessWherePossible);

    // Throws away what was not committed.
    ~ReplacingFile();

    ReplacingFile(const ReplacingFile&) = delete;
    ReplacingFile& operator=(const ReplacingFile&) = delete;

    // Makes the temporary file; called once, before the rest. What stands at the path must be
    // nothing, a regular file or a symbolic link. Returns whether it succeeded.
    bool open();

    // Appends bytes. Returns false once any write has failed.
    bool write(std::string_view bytes);

    // Puts the file in its place, with the permissions of the regular file it replaces if that
    // belongs to the effective user and has this one name. Returns false, the previous file
    // untouched, when this or any write failed. Ends the object's use.
    bool commit();

  private:
    // These return 0 or the error number.
    int prepare();
    int openDirectory();
    int readPreviousMode();
    int openHidden();
    int flush();
    int finish();
    int linkHidden();

    void openNameless(unsigned int firstMode);

    // Returns whether there was no error; after one it is reported and everything thrown away.
    bool succeeded(int error);
    void discard();

    std::string path;
    std::string name;
    std::string hiddenName;
    Temporary temporary;
    // What the file gets at its end, unless it was made with it.
    std::optional<unsigned int> mode;
    FileDescriptor directory;
    FileDescriptor file;
    std::string buffer;
    bool failed = false;
};

}  // namespace Velm
