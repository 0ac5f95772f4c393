#pragma once

// A class with two instances, served.

#include <memory>
#include <vector>

#include "FuzzService.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"

class LeafProvider : public cimomd::Provider {
  public:
    const char* className() const override { return "Leaf"; }
    std::unique_ptr<cimomd::InstanceStream> enumerate() const override {
        return std::make_unique<cimomd::RecordStream<Pegasus::Uint32>>(
            std::vector<Pegasus::Uint32>{1, 2}, [](const Pegasus::Uint32& id) {
                cimomd::InstanceBuilder builder("Leaf");
                builder.value<Pegasus::Uint32>("Id", id).text("Note", "n");
                return builder.take();
            });
    }
};

struct LeafService : FuzzService {
    LeafService()
        : FuzzService(
              "Qualifier Key : boolean = false, Scope(property), Flavor(DisableOverride);\n"
              "class Base { [Key] uint32 Id; string Note; };\n"
              "class Leaf : Base { uint16 More[]; };\n",
              std::make_unique<LeafProvider>()) {}
};
