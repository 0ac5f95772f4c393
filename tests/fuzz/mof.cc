// Any bytes as a MOF file: a class or an error, never a crash.

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "mof/MofCompiler.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    cimomd::ClassRepository repository;
    cimomd::MofCompiler compiler(repository, Pegasus::CIMNamespaceName("root/cimv2"));
    try {
        // Includes are relative to a directory that is not there.
        compiler.compileText({reinterpret_cast<const char*>(data), size}, "/nowhere/input.mof");
    } catch (const cimomd::MofErrors&) {
        if (repository.hasNamespace("root/cimv2"))
            __builtin_trap();
    }
    return 0;
}
