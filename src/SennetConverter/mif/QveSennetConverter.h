#pragma once

#include "SennetConverter/mif/SennetConverter.h"

namespace Pegasus {

/// MIF for the QVE inventory product: everything is text, names follow the limits of its columns,
/// dates are written month/day/year.
class QveSennetConverter : public SennetConverter {
  public:
    using SennetConverter::SennetConverter;

    String hashString(String text) override;
    String mifClassHeader(CimScriptParser& parser, int n) override;
    String formatString(String text) override;
    String formatEnumArray(CIMValue value, CIMType type, CIMProperty property) override;
    String getValueString(CIMValue value, CIMType type, CIMProperty property) override;
    String getTypeString(CIMClass cimClass, String propertyName, CIMType type) override;
    String formatProperty(String name) override;
    String getPropertyValueForClass(CIMProperty property, CIMType type, CIMValue value,
                                    int blankValues) override;
    void printInstances(CimScriptParser& parser, Array<CIMClass>& classes,
                        CimInstanceLists& instanceLists) override;
};

}  // namespace Pegasus
