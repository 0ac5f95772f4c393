// What the copies of a CIMObjectPath share.
#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/SharedBody.h>
#include <Pegasus/Common/String.h>

namespace Pegasus {

class ObjectPathBody : public SharedBody {
  public:
    String host;
    CIMNamespaceName nameSpace;
    CIMName className;
    Array<CIMKeyBinding> keyBindings;
};

}  // namespace Pegasus
