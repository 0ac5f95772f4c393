// The places that the configuration file names, with the defaults of this installation.
#pragma once

#include "Velm/Properties.h"

namespace Velm {

// Immutable once made, so threads may share it.
class Configuration {
  public:
    enum class Place { kSennetDirectory, kSennetResources, kMifDirectory, kSqlDirectory };

    // The configuration of this process, read at the first call.
    static const Configuration& instance();

    // The path of a place, valid to the end of the process. With a type text such as "/SMS" the
    // key of that product wins over the general one; a null type names no product.
    const char* path(Place place, const char* type = nullptr) const;

  private:
    Configuration();

    Properties properties;
};

}  // namespace Velm
