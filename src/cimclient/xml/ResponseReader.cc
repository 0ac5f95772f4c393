#include "xml/ResponseReader.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <Pegasus/Common/Exception.h>

#include "xml/MessageReader.h"
#include "xml/ScalarParser.h"
#include "xml/XmlCharacters.h"

namespace Pegasus {

void ResponseReader::read(std::string_view messageId, std::string_view method,
                          const std::function<void()>& readResult) {
    try {
        readMessage(messageId, method, readResult);
    } catch (const XmlError& error) {
        throwForClient(error);
    } catch (const UnsupportedVersion& other) {
        throw CIMClientXmlException(makeString("the answer's " + other.message));
    }
    if (status) {
        throw CIMException(static_cast<CIMStatusCode>(status->code), status->description);
    }
}

void ResponseReader::readMessage(std::string_view messageId, std::string_view method,
                                 const std::function<void()>& readResult) {
    const std::string answered = readMessageHead(reader);
    if (answered != messageId) {
        throw CIMClientResponseException(makeString("the answer is to message " +
                                                    quotedForMessage(answered) + "; expected " +
                                                    quotedForMessage(messageId)));
    }
    reader.requireChildNamed("SIMPLERSP");
    reader.requireChildNamed("IMETHODRESPONSE");
    const std::string_view answeredMethod = reader.requiredAttribute("NAME");
    if (!equalsIgnoringCase(answeredMethod, method)) {
        throw CIMClientResponseException(makeString("the answer is to method " +
                                                    quotedForMessage(answeredMethod) +
                                                    "; expected " + quotedForMessage(method)));
    }
    readMethodResponse(readResult);
    reader.readEnd();
    readMessageEnd(reader);
}

void ResponseReader::readMethodResponse(const std::function<void()>& readResult) {
    bool hasResult = false;
    while (reader.nextChild()) {
        if (reader.is("IRETURNVALUE") && !hasResult) {
            hasResult = true;
            readResult();
        } else if (reader.is("ERROR") && !status) {
            status = readError();
        } else {
            reader.failUnexpected("one IRETURNVALUE or one ERROR");
        }
    }
}

// The INSTANCE elements inside an ERROR repeat what code and description say.
ResponseReader::Status ResponseReader::readError() {
    const std::string_view code = reader.requiredAttribute("CODE");
    Status error{0, makeString(reader.attribute("DESCRIPTION").value_or(""))};
    if (!parseScalar(ElementText{code, code}, error.code) || error.code == 0) {
        reader.fail("attribute CODE is " + quotedForMessage(code) + "; expected a number above 0");
    }
    reader.skip();
    return error;
}

void ResponseReader::throwForClient(const XmlError& error) const {
    const String message = makeString(error.message + context.place());
    if (error.kind == XmlError::Kind::InvalidUtf8) {
        throw CIMClientResponseException(message);
    }
    throw CIMClientXmlException(message);
}

}  // namespace Pegasus
