// The properties or qualifiers of an object: in their order, found by name.
#pragma once

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/Exception.h>

#include <utility>
#include <vector>

namespace Pegasus {

/// `Handle` has getName() and clone(). No two have the same name, ignoring case.
template <class Handle>
class NamedList {
  public:
    Uint32 size() const { return static_cast<Uint32>(handles.size()); }

    /// Raises IndexOutOfBoundsException.
    const Handle& at(Uint32 index) const {
        if (index >= size())
            throw IndexOutOfBoundsException(index, size());
        return handles[index];
    }

    /// The position, or PEG_NOT_FOUND.
    Uint32 find(const CIMName& name) const {
        for (Uint32 i = 0; i < size(); ++i) {
            if (hashes[i] == name.hash() && handles[i].getName().equal(name))
                return i;
        }
        return PEG_NOT_FOUND;
    }

    /// Raises AlreadyExistsException; `kind` and `owner` are for its message. Raises
    /// UninitializedObjectException for a handle on nothing.
    void add(Handle handle, const char* kind, const CIMName& owner) {
        const CIMName& name = handle.getName();
        if (find(name) != PEG_NOT_FOUND)
            throw AlreadyExistsException(owner.getString() + " already has a " + String(kind) +
                                         " named " + name.getString());
        hashes.reserve(hashes.size() + 1);
        const Uint32 hash = name.hash();
        handles.push_back(std::move(handle));
        hashes.push_back(hash);
    }

    NamedList clone() const {
        NamedList copy;
        copy.hashes = hashes;
        copy.handles.reserve(handles.size());
        for (const Handle& handle : handles)
            copy.handles.push_back(handle.clone());
        return copy;
    }

  private:
    /// Of the names, in the same order: a search touches the names only where a hash fits.
    std::vector<Uint32> hashes;
    std::vector<Handle> handles;
};

}  // namespace Pegasus
