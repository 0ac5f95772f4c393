#pragma once

// The properties that everything has which can be touched.

#include "providers/InstanceBuilder.h"

namespace cimomd {

/// What is said about the thing; what its source never tells stays absent.
struct PhysicalElement {
    /// What tells it from others of its class.
    std::string tag;
    /// What people call it.
    std::string title;
    /// What it is called where it is, on a board or a case.
    Fact<std::string> name;
    Fact<std::string> manufacturer;
    Fact<std::string> model;
    Fact<std::string> sku;
    Fact<std::string> serialNumber;
    Fact<std::string> version;
    Fact<std::string> partNumber;
    Fact<std::string> assetTag;
};

/// Adds all properties that CIM_PhysicalElement declares and inherits.
void addPhysicalElement(InstanceBuilder& builder, const PhysicalElement& element);

/// Whether packages and components can be taken out; absent where the source never tells it.
struct Removability {
    Fact<bool> removable;
    Fact<bool> replaceable;
    Fact<bool> hotSwappable;
};

/// Adds what CIM_PhysicalPackage and CIM_PhysicalComponent declare.
void addRemovability(InstanceBuilder& builder, const Removability& removability);

}  // namespace cimomd
