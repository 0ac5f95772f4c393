#pragma once

// Writes the schema of one inventory script for the databases of the QVE product: a table with a
// column per property, and a view that joins it with the product's own computer table.

#include "SennetConverter/framework/CimConverter.h"

namespace Pegasus {

struct SqlDialect;

/// The schema script; a subclass names its SQL dialect.
class Cim2SqlConverter : public CimConverter {
  public:
    using CimConverter::CimConverter;

    /// Writes the schema of one script; nothing when no class has an instance.
    void printOutput(CimScriptParser& parser, Array<CIMClass>& classes,
                     CimInstanceLists& instanceLists) override;

    String hashString(String text) override;

    /// Writes the whole script. The instances are not looked at.
    virtual void PrintRDBMS(CimScriptParser& parser, Array<CIMClass>& classes,
                            CimInstanceLists& instanceLists) = 0;

  protected:
    void writeSchema(const SqlDialect& dialect, CimScriptParser& parser, Array<CIMClass>& classes);

  private:
    void writeColumns(const SqlDialect& dialect, CimScriptParser& parser, Array<CIMClass>& classes);
};

}  // namespace Pegasus
