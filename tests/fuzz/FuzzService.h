#pragma once

// The operations on a few classes, as cimomd serves them, without a machine behind them.

#include <memory>
#include <string_view>
#include <utility>

#include "mof/MofCompiler.h"
#include "protocol/CimService.h"
#include "providers/ProviderList.h"

/// Made once: the service keeps nothing from request to request.
struct FuzzService {
    FuzzService(std::string_view mof, std::unique_ptr<cimomd::Provider> provider)
        : providers(listOf(std::move(provider))), repository(compiled(mof)) {}

    cimomd::ProviderList providers;
    cimomd::ProviderIndex index{providers, Pegasus::CIMNamespaceName("root/cimv2")};
    cimomd::CurrentRepository repository;
    cimomd::Dispatcher dispatcher{repository, index};
    cimomd::CimService service{dispatcher};

  private:
    static cimomd::ProviderList listOf(std::unique_ptr<cimomd::Provider> provider) {
        cimomd::ProviderList providers;
        providers.push_back(std::move(provider));
        return providers;
    }

    static std::shared_ptr<const cimomd::ClassRepository> compiled(std::string_view mof) {
        auto classes = std::make_shared<cimomd::ClassRepository>();
        cimomd::MofCompiler(*classes, Pegasus::CIMNamespaceName("root/cimv2"))
            .compileText(mof, "classes.mof");
        return classes;
    }
};
