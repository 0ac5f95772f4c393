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
    HeadCheck(MHD_Connection* connection, const char* method) : begin(method), end(method) {
        const MHD_ConnectionInfo* info =
            MHD_get_connection_info(connection, MHD_CONNECTION_INFO_REQUEST_HEADER_SIZE);
        if (info != nullptr)
            end += info->header_size;
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
    void take(std::string_view name, std::string_view value) {
        expectBlank(name.data());
        lineEnd = value.data() + value.size();
        if (equalsIgnoringCase(name, MHD_HTTP_HEADER_HOST)) {
            ++hosts;
        } else if (equalsIgnoringCase(name, MHD_HTTP_HEADER_CONTENT_LENGTH)) {
            ++lengths;
        } else if (equalsIgnoringCase(name, MHD_HTTP_HEADER_TRANSFER_ENCODING)) {
            ++codings;
            unknownCoding = unknownCoding || !equalsIgnoringCase(trimmed(value), "chunked");
        }
    }

    /// A value ends at a NUL in it for the library. What its line had behind that still lies
    /// between the value and `next`; where lines end otherwise, nothing is left of their ends.
    void expectBlank(const char* next) {
        if (!isInHead(lineEnd) || !isInHead(next))
            return;
        constexpr std::string_view kBlank("\0\r\n \t", 5);
        hidesText = hidesText || std::any_of(lineEnd, std::max(lineEnd, next), [&](char c) {
                        return kBlank.find(c) == std::string_view::npos;
                    });
    }

    bool isInHead(const char* place) const {
        // Other pointers may come from other memory.
        return std::less_equal<>()(begin, place) && std::less_equal<>()(place, end);
    }

    const char* begin;
    const char* end;
    const char* lineEnd = nullptr;
    bool hidesText = false;
    bool unknownCoding = false;
    unsigned hosts = 0;
    unsigned lengths = 0;
    unsigned codings = 0;
};

}  // namespace

HttpHead requestHead(MHD_Connection* connection, const char* url, const char* method) {
    HttpHead head;
    head.method = method;
    head.path = url;
    head.fromNetwork = isFromNetwork(connection);
    head.isAmbiguous = HeadCheck(connection, method).isAmbiguous();
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
