// What a program has to settle before anything else, so that odd surroundings (closed standard
// streams, a limit of the file size, too little memory) cost it no file. Not for libraries: these
// are properties of the whole process.
#pragma once

/// Opens /dev/null in the place of each standard stream that the program was started without.
/// Otherwise the next file to be opened would get its number, and messages would go into the file.
/// False when that cannot be done.
bool holdStandardStreams();

/// Makes a write beyond the limit of the file size fail like any other (EFBIG).
void outliveFileSizeLimit();

/// Narrows the umask so that new files and directories can be written to by the user and his group
/// at most.
void keepOthersFromWriting();

/// From now on the first request for memory that fails ends the process with status 1 and a line on
/// standard error that begins with `program`, a string literal. No destructor runs, so that none
/// completes a file that holds half of its content.
void endWhenMemoryIsShort(const char* program);
