#include "protocol/ResponseStream.h"

#include <Pegasus/Common/CIMStatusCode.h>

#include <algorithm>
#include <cstring>
#include <utility>

#include "text/CimText.h"
#include "utf8/Utf8.h"

namespace cimomd {
namespace {

/// An answer that fails before there is so much of it is an ERROR and nothing else.
constexpr std::size_t kEnoughPending = std::size_t{32} << 10;

}  // namespace

CimStatus CimStatus::of(const Pegasus::CIMException& error) {
    return {static_cast<unsigned>(error.getCode()), utf8Of(error.getMessage())};
}

ResponseStream::ResponseStream(const Pegasus::CimRequest& request, bool trailers)
    : messageId(request.messageId),
      method(request.method),
      kind(request.isExtrinsic ? Pegasus::CallKind::Extrinsic : Pegasus::CallKind::Intrinsic),
      withTrailers(trailers) {}

void ResponseStream::fail(const CimStatus& status) {
    if (handedOver && !withTrailers) {
        broken = true;
        return;
    }
    if (!handedOver) {
        pending.clear();
        offset = 0;
        Pegasus::beginResponse(pending, messageId, method, kind);
        if (!withTrailers)
            Pegasus::appendError(pending, status.code, cimString(status.description));
    } else if (begun) {
        Pegasus::endReturnValue(pending);
    }
    if (withTrailers)
        trailer = status;
    Pegasus::endResponse(pending, kind);
    finished = true;
}

ResponseStream::Outcome ResponseStream::read(char* buffer, std::size_t capacity,
                                             std::size_t& count) {
    fill(capacity);
    if (broken)
        return Outcome::Broken;
    count = std::min(capacity, pending.size() - offset);
    if (count == 0)
        return Outcome::End;
    std::memcpy(buffer, pending.data() + offset, count);
    offset += count;
    handedOver = true;
    return Outcome::Data;
}

void ResponseStream::fill(std::size_t wanted) {
    if (pending.size() - offset >= wanted)
        return;
    pending.erase(0, offset);
    offset = 0;
    while (pending.size() < std::max(wanted, kEnoughPending) && !finished && !broken)
        step();
}

void ResponseStream::step() {
    if (!begun) {
        Pegasus::beginResponse(pending, messageId, method, kind);
        Pegasus::beginReturnValue(pending);
        begun = true;
    }
    const std::size_t before = pending.size();
    try {
        if (!answer->next(pending))
            finish();
    } catch (const Pegasus::CIMException& error) {
        pending.resize(before);
        fail(CimStatus::of(error));
    } catch (const Pegasus::Exception& error) {
        pending.resize(before);
        fail({Pegasus::CIM_ERR_FAILED, utf8Of(error.getMessage())});
    } catch (const std::exception& error) {
        pending.resize(before);
        fail({Pegasus::CIM_ERR_FAILED, utf8::clean(error.what())});
    }
}

void ResponseStream::finish() {
    Pegasus::endReturnValue(pending);
    Pegasus::endResponse(pending, kind);
    finished = true;
}

}  // namespace cimomd
