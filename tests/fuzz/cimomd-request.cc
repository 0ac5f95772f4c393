// Any bytes as the body of a request: an answer or a refusal, never a crash.

#include <array>
#include <cstddef>
#include <cstdint>

#include "LeafService.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    static const LeafService leaves;
    cimomd::HttpHead head;
    if (size % 2 == 0)
        head.te = "trailers";
    cimomd::HttpAnswer answer =
        leaves.service.answer(head, {reinterpret_cast<const char*>(data), size});
    std::array<char, 512> buffer;
    std::size_t count = 0;
    while (answer.body && answer.body->read(buffer.data(), buffer.size(), count) ==
                              cimomd::ResponseStream::Outcome::Data) {
    }
    return 0;
}
