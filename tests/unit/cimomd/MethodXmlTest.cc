#include "protocol/MethodXml.h"

#include <gtest/gtest.h>

namespace cimomd {
namespace {

std::shared_ptr<const MethodDeclaration> sampleMethod(bool propagated) {
    MethodDeclaration method;
    method.name = "Start";
    method.classOrigin = "Base";
    method.isPropagated = propagated;
    method.qualifiers.push_back(
        Pegasus::CIMQualifier("Description", Pegasus::CIMValue(Pegasus::String("s"))));
    ParameterDeclaration when{"When", Pegasus::CIMTYPE_DATETIME, {}, false, 0, {}};
    when.qualifiers.push_back(Pegasus::CIMQualifier("In", Pegasus::CIMValue(true)));
    method.parameters = {when,
                         {"Names", Pegasus::CIMTYPE_STRING, {}, true, 4, {}},
                         {"Job", Pegasus::CIMTYPE_REFERENCE, "CIM_Job", false, 0, {}},
                         {"All", Pegasus::CIMTYPE_REFERENCE, "CIM_Job", true, 0, {}}};
    return std::make_shared<const MethodDeclaration>(method);
}

std::string written(bool propagated, const Pegasus::ObjectXmlOptions& options) {
    std::string xml;
    appendMethods(xml, {sampleMethod(propagated)}, options);
    return xml;
}

TEST(MethodXml, writesMethodsWithTheirParameters) {
    EXPECT_EQ(written(true, {}),
              "<METHOD NAME=\"Start\" TYPE=\"uint32\" CLASSORIGIN=\"Base\" PROPAGATED=\"true\">"
              "<QUALIFIER NAME=\"Description\" TYPE=\"string\"><VALUE>s</VALUE></QUALIFIER>"
              "<PARAMETER NAME=\"When\" TYPE=\"datetime\"><QUALIFIER NAME=\"In\" TYPE=\"boolean\">"
              "<VALUE>TRUE</VALUE></QUALIFIER></PARAMETER>"
              "<PARAMETER.ARRAY NAME=\"Names\" TYPE=\"string\" ARRAYSIZE=\"4\"></PARAMETER.ARRAY>"
              "<PARAMETER.REFERENCE NAME=\"Job\" REFERENCECLASS=\"CIM_Job\">"
              "</PARAMETER.REFERENCE>"
              "<PARAMETER.REFARRAY NAME=\"All\" REFERENCECLASS=\"CIM_Job\"></PARAMETER.REFARRAY>"
              "</METHOD>");
}

TEST(MethodXml, leavesOutWhatTheOptionsLeaveOut) {
    Pegasus::ObjectXmlOptions options;
    options.localOnly = true;
    EXPECT_EQ(written(true, options), "");
    EXPECT_NE(written(false, options), "");
    options.includeQualifiers = false;
    options.includeClassOrigin = false;
    const std::string bare = written(false, options);
    EXPECT_EQ(bare.find("QUALIFIER"), std::string::npos);
    EXPECT_EQ(bare.find("<METHOD NAME=\"Start\" TYPE=\"uint32\"><PARAMETER "), 0U);
}

}  // namespace
}  // namespace cimomd
