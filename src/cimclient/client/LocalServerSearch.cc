#include <Pegasus/Client/LocalServerSearch.h>
#include <Pegasus/Common/Exception.h>

#include "client/LocalConnector.h"

namespace Pegasus {

LocalServerSearch searchLocalServer(unsigned timeoutMilliseconds) {
    LocalServerSearch search;
    std::vector<TriedPlace> tried;
    try {
        connectToLocalServer(ServerPlaces::standard(), Deadline(timeoutMilliseconds), &tried);
    } catch (const Exception& failure) {
        search.failure = static_cast<const char*>(failure.getMessage().getCString());
    }
    for (const TriedPlace& place : tried) {
        search.places.push_back({place.path, place.owner, place.result, place.chosen});
    }
    return search;
}

}  // namespace Pegasus
