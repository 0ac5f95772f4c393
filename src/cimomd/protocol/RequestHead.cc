#include "protocol/RequestHead.h"

#include <microhttpd.h>
#include <sys/socket.h>

#include <algorithm>
#include <functional>
#include <string_view>

#include "text/Utf8.h"

namespace cimomd {
namespace {

bool isFromNetwork(MHD_Connection* connection) {
    const MHD_ConnectionInfo* info =
        MHD_get_connection_info(connection, MHD_CONNECTION_INFO_CLIENT_ADDRESS);
    return info->client_addr->sa_family != AF_UNIX;
}

std::optional<std::string> header(MHD_Connection* connection, const char* name) {
    const char* value = MHD_lookup_connection_value(connection, MHD_HEADER_KIND, name);
    return value == nullptr ? std::nullopt : std::optional<std::string>(value);
}

/// What two readers of the same head could understand differently.
class HeadCheck {
  public:
    /// The library cuts the head up where it lies, which starts with the method.
    HeadCheck(MHD_Connection* connection, const RequestLine& line)
        : begin(line.method), end(line.method), checked(line.method) {
        const MHD_ConnectionInfo* info =
            MHD_get_connection_info(connection, MHD_CONNECTION_INFO_REQUEST_HEADER_SIZE);
        if (info != nullptr)
            end += info->header_size;
        for (const char* part : {line.method, line.url, line.version})
            takePart(part);
        const auto each = [](void* self, MHD_ValueKind, const char* name, std::size_t nameSize,
                             const char* value, std::size_t valueSize) -> MHD_Result {
            static_cast<HeadCheck*>(self)->take({name, nameSize}, {value, valueSize});
            return MHD_YES;
        };
        MHD_get_connection_values_n(connection, MHD_HEADER_KIND,
                                    static_cast<MHD_KeyValueIteratorN>(each), this);
        expectBlank(end);
    }

    /// RFC 9112: 3.2 has one Host, 6.1 and 6.3 one way to tell where the body ends.
    bool isAmbiguous() const {
        return hidesText || hosts > 1 || lengths + codings > 1 || unknownCoding;
    }

  private:
    void takePart(std::string_view part) {
        expectBlank(part.data());
        checked = part.data() + part.size();
    }

    void take(std::string_view name, std::string_view value) {
        expectBlank(name.data());
        checked = value.data() + value.size();
        if (equalsIgnoringCase(name, MHD_HTTP_HEADER_HOST)) {
            ++hosts;
        } else if (equalsIgnoringCase(name, MHD_HTTP_HEADER_CONTENT_LENGTH)) {
            ++lengths;
        } else if (equalsIgnoringCase(name, MHD_HTTP_HEADER_TRANSFER_ENCODING)) {
            ++codings;
            unknownCoding = unknownCoding || !equalsIgnoringCase(trimmed(value), "chunked");
        }
    }

    /// A text ends at a NUL in it for the library, whatever sizes it tells. What the client sent
    /// behind that still lies before the next text; where texts end otherwise, nothing is left of
    /// their ends. Where the library has a text elsewhere nobody can tell, so it is refused.
    void expectBlank(const char* next) {
        constexpr std::string_view kBlank("\0\r\n \t", 5);
        hidesText = hidesText || !isInHead(checked) || !isInHead(next) ||
                    std::any_of(checked, std::max(checked, next),
                                [&](char c) { return kBlank.find(c) == std::string_view::npos; });
    }

    bool isInHead(const char* place) const {
        // Other pointers may come from other memory.
        return std::less_equal<>()(begin, place) && std::less_equal<>()(place, end);
    }

    const char* begin;
    const char* end;
    /// Where the text ends that was looked at last.
    const char* checked;
    bool hidesText = false;
    bool unknownCoding = false;
    unsigned hosts = 0;
    unsigned lengths = 0;
    unsigned codings = 0;
};

}  // namespace

HttpHead requestHead(MHD_Connection* connection, const RequestLine& line) {
    HttpHead head;
    head.method = line.method;
    head.path = line.url;
    head.fromNetwork = isFromNetwork(connection);
    head.isAmbiguous = HeadCheck(connection, line).isAmbiguous();
    head.host = header(connection, MHD_HTTP_HEADER_HOST);
    head.contentType = header(connection, MHD_HTTP_HEADER_CONTENT_TYPE);
    head.contentLength = header(connection, MHD_HTTP_HEADER_CONTENT_LENGTH);
    head.te = header(connection, MHD_HTTP_HEADER_TE);
    head.cimOperation = header(connection, "CIMOperation");
    head.cimMethod = header(connection, "CIMMethod");
    head.cimObject = header(connection, "CIMObject");
    return head;
}

}  // namespace cimomd
