#pragma once

#include "SennetConverter/mif/SennetConverter.h"

namespace Pegasus {

/// MIF for CA: no template and table but one numbered group per instance.
class CaSennetConverter : public SennetConverter {
  public:
    using SennetConverter::SennetConverter;

    void printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                     CimInstanceLists& instanceLists) override;
    String mifClassHeader(CimScriptParser& parser, int n) override;
    String formatString(String text) override;
    String getPropertyValueForClass(CIMProperty property, CIMType type, CIMValue value,
                                    int blankValues) override;
};

}  // namespace Pegasus
