#pragma once

// What providers make of the recorded machines.

#include <gtest/gtest.h>

#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "FixedSystemCalls.h"
#include "InstanceText.h"
#include "SchemaConformance.h"
#include "machines/Machine.h"

namespace cimomd {

using Expected = std::vector<std::pair<const char*, const char*>>;
using Row = std::vector<std::string>;
using Table = std::vector<Row>;

inline void expectProperties(const Pegasus::CIMInstance& instance, const Expected& expected) {
    for (const auto& [property, text] : expected)
        EXPECT_EQ(textOf(instance, property), text) << property;
}

/// The named properties of all instances, a row for each.
inline Table tableOf(const Provider& provider, const std::vector<const char*>& properties) {
    Table table;
    for (const Pegasus::CIMInstance& instance : all(provider.enumerate())) {
        Row& row = table.emplace_back();
        for (const char* property : properties)
            row.push_back(textOf(instance, property));
    }
    return table;
}

/// A provider that asks the kernel gets fixed answers.
template <typename OneProvider>
OneProvider providerOf(const char* machineName) {
    static const FixedSystemCalls calls;
    if constexpr (std::is_constructible_v<OneProvider, SystemPaths, const SystemCalls&>)
        return OneProvider(machine(machineName), calls);
    else
        return OneProvider(machine(machineName));
}

/// All instances, of a provider that is held against the schema first.
template <typename OneProvider>
std::vector<Pegasus::CIMInstance> servedInstances(const char* machineName) {
    SCOPED_TRACE(machineName);
    const OneProvider provider = providerOf<OneProvider>(machineName);
    expectServesItsClass(provider);
    return all(provider.enumerate());
}

}  // namespace cimomd
