#include "SennetConverter/shell/LumoCim2ShConverter.h"

#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

String LumoCim2ShConverter::substituteValues(String text) {
    return SennetUtilities::substituteValues(text);
}

}  // namespace Pegasus
