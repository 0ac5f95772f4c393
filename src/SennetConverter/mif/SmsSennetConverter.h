#pragma once

#include "SennetConverter/mif/SennetConverter.h"

namespace Pegasus {

/// MIF for Microsoft SMS: the template holds the first instance, whose row comes last.
class SmsSennetConverter : public SennetConverter {
  public:
    using SennetConverter::SennetConverter;

    String mifClassHeader(CimScriptParser& parser, int n) override;
    String getPropertyValueForClass(CIMProperty property, CIMType type, CIMValue value,
                                    int blankValues) override;
    void printInstances(CimScriptParser& parser, Array<CIMClass>& classes,
                        CimInstanceLists& instanceLists) override;
};

}  // namespace Pegasus
