#include "SennetConverter/mif/QveLumoSennetConverter.h"

#include "SennetConverter/framework/SennetUtilities.h"

namespace Pegasus {

String QveLumoSennetConverter::substituteValues(String text) {
    return SennetUtilities::substituteValues(text);
}

}  // namespace Pegasus
