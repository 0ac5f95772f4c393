#pragma once

// Writes a bash script that registers one query per inventory script with the QVE product; the
// query reads the view that the schema script creates.

#include "SennetConverter/framework/CimConverter.h"

namespace Pegasus {

/// The query script.
class Cim2ShConverter : public CimConverter {
  public:
    using CimConverter::CimConverter;

    /// Writes the query of one script; nothing when no class has an instance.
    void printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                     CimInstanceLists& instanceLists) override;

    String hashString(String text) override;

    /// Writes the whole script. The instances are not looked at.
    virtual void PrintBashScript(CimScriptParser& parser, Array<CIMClass>& classes,
                                 CimInstanceLists& instanceLists);
};

}  // namespace Pegasus
