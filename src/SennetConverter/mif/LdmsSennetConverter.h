#pragma once

#include "SennetConverter/mif/SennetConverter.h"

namespace Pegasus {

/// MIF for LANDesk: integers are declared as text.
class LdmsSennetConverter : public SennetConverter {
  public:
    using SennetConverter::SennetConverter;

    String getTypeString(CIMClass cimClass, String propertyName, CIMType type) override;
};

}  // namespace Pegasus
