// The properties or qualifiers of an object: in their order, found by name.
#pragma once

#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/Exception.h>

#include <map>
#include <memory>
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
    Uint32 find(const CIMName& name) const { return index ? findInIndex(name) : scan(name); }

    /// Raises AlreadyExistsException; `kind` and `owner` are for its message. Raises
    /// UninitializedObjectException for a handle on nothing.
    void add(Handle handle, const char* kind, const CIMName& owner) {
        const CIMName name = handle.getName();
        if (find(name) != PEG_NOT_FOUND)
            throw AlreadyExistsException(owner.getString() + " already has a " + String(kind) +
                                         " named " + name.getString());
        append(std::move(handle), name);
    }

    NamedList clone() const {
        NamedList copy;
        copy.hashes.reserve(hashes.size());
        copy.handles.reserve(handles.size());
        for (const Handle& handle : handles)
            copy.append(handle.clone(), handle.getName());
        return copy;
    }

  private:
    struct ByHashThenText {
        bool operator()(const CIMName& a, const CIMName& b) const {
            if (a.hash() != b.hash())
                return a.hash() < b.hash();
            return String::compareNoCase(a.getString(), b.getString()) < 0;
        }
    };
    using Index = std::map<CIMName, Uint32, ByHashThenText>;

    /// Real classes have some hundred properties at most, and scanning so many hashes is quick.
    /// The index keeps an absurd number of them, all of one hash even, from taking forever.
    static constexpr Uint32 kIndexFrom = 512;

    Uint32 scan(const CIMName& name) const {
        for (Uint32 i = 0; i < size(); ++i) {
            if (hashes[i] == name.hash() && handles[i].getName().equal(name))
                return i;
        }
        return PEG_NOT_FOUND;
    }

    Uint32 findInIndex(const CIMName& name) const {
        const auto found = index->find(name);
        return found == index->end() ? PEG_NOT_FOUND : found->second;
    }

    void append(Handle handle, const CIMName& name) {
        hashes.push_back(name.hash());
        handles.push_back(std::move(handle));
        if (index)
            index->emplace(name, size() - 1);
        else if (size() == kIndexFrom)
            makeIndex();
    }

    void makeIndex() {
        index = std::make_unique<Index>();
        for (Uint32 i = 0; i < size(); ++i)
            index->emplace(handles[i].getName(), i);
    }

    /// Of the names, in the order of the handles: a scan touches a name only where a hash fits.
    std::vector<Uint32> hashes;
    std::vector<Handle> handles;
    std::unique_ptr<Index> index;
};

}  // namespace Pegasus
