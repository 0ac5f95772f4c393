// Reads the text form of an object path: [//host/][namespace:]Class[.key=value,key=value].
#pragma once

#include <Pegasus/Common/CIMKeyBinding.h>
#include <Pegasus/Common/String.h>

#include "ObjectPathBody.h"

namespace Pegasus {

class ObjectPathParser {
  public:
    /// `text` is held by reference and must outlive the parser.
    explicit ObjectPathParser(const String& text) : text(text) {}

    /// Fills `path`, which is empty before. Raises MalformedObjectNameException.
    void parse(ObjectPathBody& path);

  private:
    void parseHost(ObjectPathBody& path);
    void parseNamespace(ObjectPathBody& path);
    void parseKeys(ObjectPathBody& path);
    CIMKeyBinding parseKey();
    String parseQuoted();
    CIMKeyBinding parseBare(const CIMName& key);

    CIMName readName(Uint32 end);
    String readUpTo(Uint32 end);
    Uint32 findFirstOf(Char16 a, Char16 b) const;
    [[noreturn]] void fail(const char* expected) const;

    const String& text;
    Uint32 at = 0;
};

/// Raises MalformedObjectNameException when `host` has a "/", a blank or a control character.
void requireHost(const String& host);

}  // namespace Pegasus
