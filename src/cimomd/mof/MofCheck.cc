#include "mof/MofCheck.h"

#include "mof/MofCompiler.h"

namespace cimomd {
namespace {

void checkAlone(const std::vector<std::filesystem::path>& files, const ClassRepository& shipped,
                const Pegasus::CIMNamespaceName& nameSpace, const MofErrors& errorsOnTop) {
    ClassRepository empty;
    try {
        MofCompiler compiler(empty, nameSpace);
        compiler.useQualifiersOf(shipped);
        compiler.compileFiles(files);
    } catch (const MofErrors& errors) {
        if (errors.errors().size() > errorsOnTop.errors().size())
            throw MofErrors(errorsOnTop);
        throw;
    }
}

}  // namespace

void checkMofFiles(const std::vector<std::filesystem::path>& files, const ClassRepository& shipped,
                   const Pegasus::CIMNamespaceName& nameSpace) {
    ClassRepository onTop = shipped;
    MofCompiler compiler(onTop, nameSpace);
    try {
        compiler.compileFiles(files);
    } catch (const MofErrors& errors) {
        if (!compiler.redeclaredQualifiers())
            throw;
        checkAlone(files, shipped, nameSpace, errors);
    }
}

}  // namespace cimomd
