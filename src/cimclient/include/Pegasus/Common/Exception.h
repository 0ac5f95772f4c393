// The exceptions of the CIM client library. None derives from std::exception, so that a handler
// for one family never catches the other.
#pragma once

#include <Pegasus/Common/CIMStatusCode.h>
#include <Pegasus/Common/String.h>

namespace Pegasus {

/// The root of them all; can be copied and caught by value.
class Exception {
  public:
    explicit Exception(String message);
    Exception(const Exception&) = default;
    Exception(Exception&&) = default;
    Exception& operator=(const Exception&) = default;
    Exception& operator=(Exception&&) = default;
    virtual ~Exception();

    const String& getMessage() const { return message; }

  private:
    String message;
};

/// A position outside an array, a string, or the properties or qualifiers of an object.
class IndexOutOfBoundsException : public Exception {
  public:
    using Exception::Exception;
    IndexOutOfBoundsException(Uint32 index, Uint32 size);
};

/// Text that is no CIM name.
class InvalidNameException : public Exception {
  public:
    using Exception::Exception;
};

/// Text that is no namespace name.
class InvalidNamespaceNameException : public Exception {
  public:
    using Exception::Exception;
};

/// A property or qualifier of a name that the object already has.
class AlreadyExistsException : public Exception {
  public:
    using Exception::Exception;
};

/// A handle was used that refers to no object.
class UninitializedObjectException : public Exception {
  public:
    using Exception::Exception;
};

/// A value was asked for as another type than it has.
class TypeMismatchException : public Exception {
  public:
    using Exception::Exception;
};

/// Text that does not have the form of a CIM datetime.
class InvalidDateTimeFormatException : public Exception {
  public:
    using Exception::Exception;
};

/// A datetime of the right form with a field that cannot be, such as a thirteenth month.
class DateTimeOutOfRangeException : public Exception {
  public:
    using Exception::Exception;
};

/// Text that is no object path, or a part that cannot be in one.
class MalformedObjectNameException : public Exception {
  public:
    using Exception::Exception;
};

/// There is no server to be reached.
class CannotConnectException : public Exception {
  public:
    using Exception::Exception;
};

/// A second connect without a disconnect between.
class AlreadyConnectedException : public Exception {
  public:
    using Exception::Exception;
};

/// An operation before the connect.
class NotConnectedException : public Exception {
  public:
    using Exception::Exception;
};

/// No whole answer within the time-out.
class ConnectionTimeoutException : public Exception {
  public:
    using Exception::Exception;
};

/// The server answered with a CIM error; the code may be one that CIMStatusCode does not list.
class CIMException : public Exception {
  public:
    explicit CIMException(CIMStatusCode code, String message = String());
    CIMStatusCode getCode() const { return code; }

  private:
    CIMStatusCode code;
};

}  // namespace Pegasus
