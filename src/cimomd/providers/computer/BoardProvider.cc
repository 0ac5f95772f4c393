#include "providers/computer/BoardProvider.h"

#include <fmt/format.h>

#include "providers/PhysicalElement.h"
#include "providers/RecordStream.h"

namespace cimomd {

std::unique_ptr<InstanceStream> BoardProvider::enumerate() const {
    const Fact<std::vector<Board>> found = readBoards(paths);
    if (!found)
        return std::make_unique<EmptyStream>(found.reason());
    return std::make_unique<RecordStream<Board>>(*found, publish);
}

ProvidedInstance BoardProvider::publish(const Board& board) {
    constexpr std::size_t kLocationLength = 256;
    PhysicalElement element;
    element.tag = fmt::format("Board {}", board.index);
    element.title = board.model.value_or(element.tag);
    element.manufacturer = board.manufacturer;
    element.model = board.model;
    element.version = board.version;
    element.serialNumber = board.serialNumber;
    element.assetTag = board.assetTag;
    InstanceBuilder builder(kClassName);
    addPhysicalElement(builder, element);
    addRemovability(builder, {board.removable, board.replaceable, board.hotSwappable});
    builder.value<Pegasus::Boolean>("HostingBoard", board.hosting)
        .text("Location", board.location, kLocationLength);
    return builder.take();
}

}  // namespace cimomd
