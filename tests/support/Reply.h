#pragma once

// One scripted answer of FakeCimServer: which octets go out, in which pieces, and whether the
// connection stays open afterwards. A value; the modifiers return the changed reply, so that they
// can be chained: Reply::ok(xml).chunkSize(7).thenClose().

#include <cstddef>
#include <string>
#include <utility>
#include <vector>

#include "support/RecordedRequest.h"

namespace support {

class Reply {
  public:
    using Fields = std::vector<std::pair<std::string, std::string>>;

    // 200 with a whole CIM-XML message: what stands in IRETURNVALUE is given. Chunked.
    static Reply ok(std::string returnValueXml);
    // 200 with an IMETHODRESPONSE that holds nothing.
    static Reply empty();
    // A CIM error as real servers report it to a client that accepts trailers: the body is that of
    // empty(), the code and the percent-encoded description follow the last chunk.
    static Reply cimError(unsigned code, std::string description);
    // A CIM error as an ERROR element in the body.
    static Reply cimErrorElement(unsigned code, std::string description);
    // 200 with this XML document. "@ID@" and "@METHOD@" in it stand for the request's.
    static Reply document(std::string xml);
    // The given status, headers and body, with a Content-Length. Nothing is added otherwise.
    static Reply http(int status, Fields headers, std::string body = "");
    // Exactly these octets ("@ID@" and "@METHOD@" replaced), then the connection is closed.
    static Reply raw(std::string bytes);
    // The request is read, then the connection is closed.
    static Reply closeAtOnce();
    // The connection is closed before the request is read, which the client sees as a reset.
    static Reply reset();
    // The request is read and never answered.
    static Reply silence();
    // As raw, one octet at a time with a pause after each.
    static Reply drip(std::string bytes, unsigned millisecondsPerByte);

    // Chunked replies: octets per chunk; the default is one chunk for the whole body.
    Reply chunkSize(std::size_t octets) const;
    // Sends the body with a Content-Length instead of chunks (trailers cannot be sent then).
    Reply contentLength() const;
    // Leaves the Content-Length of http() out.
    Reply withoutLength() const;
    // One more line after the last chunk.
    Reply trailer(std::string name, std::string value) const;
    // One more header line; a header of that name (in any case) that the reply has is replaced.
    Reply header(std::string name, std::string value) const;
    // The message ID to answer with instead of the request's.
    Reply messageId(std::string id) const;
    // Sends only so many octets of the whole answer, header included, then closes.
    Reply cutAfter(std::size_t octets) const;
    // Sends octets that belong to no answer after the answer.
    Reply followedBy(std::string bytes) const;
    // Closes the connection after the answer, without saying so in the header.
    Reply thenClose() const;

    // The octets of the answer to a request.
    std::string render(const RecordedRequest& request) const;
    bool closesBeforeReading() const { return behaviour == Behaviour::Reset; }
    bool staysSilent() const { return behaviour == Behaviour::Silence; }
    bool closesAfterwards() const { return close || cut != kUncut; }
    unsigned millisecondsPerByte() const { return dripMilliseconds; }

  private:
    enum class Behaviour { Answer, Silence, Reset };
    enum class Framing { Chunked, ContentLength, None };
    static constexpr std::size_t kUncut = static_cast<std::size_t>(-1);

    std::string head() const;
    void appendChunks(std::string& out, const std::string& body) const;

    Behaviour behaviour = Behaviour::Answer;
    Framing framing = Framing::None;
    int status = 0;  // 0: no header is made, the body is all
    Fields headers;
    Fields trailers;
    std::string body;
    std::string after;
    std::string forcedMessageId;
    std::size_t octetsPerChunk = 0;
    std::size_t cut = kUncut;
    unsigned dripMilliseconds = 0;
    bool close = false;
};

}  // namespace support
