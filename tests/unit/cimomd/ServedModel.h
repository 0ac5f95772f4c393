#pragma once

// A dispatcher over the classes of a MOF text and over providers of the test.

#include <memory>
#include <string>
#include <string_view>

#include "mof/MofCompiler.h"
#include "protocol/Dispatcher.h"
#include "providers/ProviderList.h"

namespace cimomd {

inline std::shared_ptr<const ClassRepository> compiledClasses(std::string_view mof) {
    auto classes = std::make_shared<ClassRepository>();
    MofCompiler(*classes, Pegasus::CIMNamespaceName("root/cimv2")).compileText(mof, "t");
    return classes;
}

/// All of it in root/cimv2.
struct ServedModel {
    explicit ServedModel(std::string_view mof, ProviderList providerList = {})
        : providers(std::move(providerList)), repository(compiledClasses(mof)) {}

    ProviderList providers;
    CurrentRepository repository;
    ProviderIndex index{providers, Pegasus::CIMNamespaceName("root/cimv2")};
    Dispatcher dispatcher{repository, index};
};

}  // namespace cimomd
