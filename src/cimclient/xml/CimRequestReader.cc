// Decodes a request as a server receives it.

#include <utility>

#include "xml/CimRequest.h"
#include "xml/DecodeContext.h"
#include "xml/ElementReader.h"
#include "xml/MessageReader.h"
#include "xml/NameCache.h"
#include "xml/PathReader.h"
#include "xml/ValueReader.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

namespace {

// The most parameters that any operation of DSP0200 has, and some more.
constexpr std::size_t kMaxParameters = 32;

class RequestReader {
  public:
    explicit RequestReader(ByteSource& source) : reader(source), context(names) {}

    CimRequest read() {
        CimRequest request;
        request.messageId = readMessageHead(reader);
        enterCall();
        request.isExtrinsic = reader.is("METHODCALL");
        request.method = reader.requiredAttribute("NAME");
        if (request.isExtrinsic) {
            readMethodCall(request);
        } else {
            readOperation(request);
        }
        if (reader.nextChild()) {
            reader.failUnexpected("one call");
        }
        readMessageEnd(reader);
        return request;
    }

  private:
    void enterCall() {
        reader.requireChild("SIMPLEREQ");
        if (reader.is("MULTIREQ") || reader.is("MULTIEXPREQ")) {
            throw CimRequestError{"multiple-requests-unsupported", "expected SIMPLEREQ"};
        }
        if (reader.is("SIMPLEEXPREQ")) {
            throw CimRequestError{"unsupported-operation", "indications are not received here"};
        }
        if (!reader.is("SIMPLEREQ")) {
            reader.failUnexpected("SIMPLEREQ");
        }
        reader.requireChild("IMETHODCALL or METHODCALL");
        if (!reader.is("IMETHODCALL") && !reader.is("METHODCALL")) {
            reader.failUnexpected("IMETHODCALL or METHODCALL");
        }
    }

    void readOperation(CimRequest& request) {
        reader.requireChildNamed("LOCALNAMESPACEPATH");
        request.nameSpace = PathReader(reader, context).readLocalNamespacePath();
        readParameters(request);
    }

    void readMethodCall(CimRequest& request) {
        reader.requireChild("LOCALCLASSPATH or LOCALINSTANCEPATH");
        PathReader paths(reader, context);
        if (reader.is("LOCALCLASSPATH")) {
            request.nameSpace = paths.readLocalClassPath().getNameSpace();
        } else if (reader.is("LOCALINSTANCEPATH")) {
            request.nameSpace = paths.readLocalInstancePath().getNameSpace();
        } else {
            reader.failUnexpected("LOCALCLASSPATH or LOCALINSTANCEPATH");
        }
        while (reader.nextChild()) {
            if (!reader.is("PARAMVALUE")) {
                reader.failUnexpected("PARAMVALUE");
            }
            reader.skip();
        }
    }

    void readParameters(CimRequest& request) {
        while (reader.nextChild()) {
            if (!reader.is("IPARAMVALUE") || request.parameters.size() == kMaxParameters) {
                reader.failUnexpected("at most 32 IPARAMVALUE");
            }
            std::string name(reader.requiredAttribute("NAME"));
            CimParameter::Value value = readParameterValue();
            request.parameters.push_back({std::move(name), std::move(value)});
        }
    }

    CimParameter::Value readParameterValue() {
        CimParameter::Value value;
        if (reader.nextChild()) {
            value = readValueElement();
            reader.readEnd();
        }
        return value;
    }

    CimParameter::Value readValueElement() {
        if (reader.is("VALUE")) {
            return takeText(ValueReader(reader, context).readScalar(CIMTYPE_STRING));
        }
        if (reader.is("VALUE.ARRAY")) {
            return takeTexts(ValueReader(reader, context).readArray(CIMTYPE_STRING));
        }
        if (reader.is("CLASSNAME")) {
            return PathReader(reader, context).readClassName();
        }
        if (reader.is("INSTANCENAME")) {
            return PathReader(reader, context).readInstanceName();
        }
        // Well-formed is enough: operations that take such a parameter are not served.
        reader.skip();
        return UnreadParameter();
    }

    static String takeText(const CIMValue& value) {
        String text;
        value.get(text);
        return text;
    }

    static Array<String> takeTexts(const CIMValue& value) {
        Array<String> texts;
        value.get(texts);
        return texts;
    }

    ElementReader reader;
    NameCache names;
    DecodeContext context;
};

const char* wordFor(UnsupportedVersion::What what) {
    switch (what) {
        case UnsupportedVersion::What::Cim:
            return "unsupported-cim-version";
        case UnsupportedVersion::What::Dtd:
            return "unsupported-dtd-version";
        case UnsupportedVersion::What::Protocol:
            break;
    }
    return "unsupported-protocol-version";
}

}  // namespace

CimRequest decodeRequest(ByteSource& source) {
    try {
        return RequestReader(source).read();
    } catch (const XmlError& error) {
        const bool isWellFormed =
            error.kind == XmlError::Kind::Content || error.kind == XmlError::Kind::Limit;
        throw CimRequestError{isWellFormed ? "request-not-valid" : "request-not-well-formed",
                              error.message};
    } catch (const UnsupportedVersion& other) {
        throw CimRequestError{wordFor(other.what), other.message};
    }
}

}  // namespace Pegasus
