"""Right answers of a CIM server, of which the tests make wrong ones."""

HEAD = b"HTTP/1.1 200 OK\r\nContent-Type: application/xml; charset=utf-8\r\n"
CHUNKED = HEAD + b"Transfer-Encoding: chunked\r\n\r\n"


def document(request, content, message_id=None):
    """A CIM-XML answer; `content` stands in the place of IRETURNVALUE."""
    return ('<?xml version="1.0" encoding="utf-8"?>\n<CIM CIMVERSION="2.0" DTDVERSION="2.0">'
            f'<MESSAGE ID="{message_id or request.message_id}" PROTOCOLVERSION="1.0"><SIMPLERSP>'
            f'<IMETHODRESPONSE NAME="{request.method}">{content}</IMETHODRESPONSE></SIMPLERSP>'
            '</MESSAGE></CIM>\n').encode()


def result(request, content):
    return document(request, f"<IRETURNVALUE>{content}</IRETURNVALUE>")


def cim_class(name, properties=""):
    """A class with the string property Name, MaxLen 64."""
    return (f'<CLASS NAME="{name}"><PROPERTY NAME="Name" TYPE="string">'
            '<QUALIFIER NAME="MaxLen" TYPE="uint32"><VALUE>64</VALUE></QUALIFIER></PROPERTY>'
            f'{properties}</CLASS>')


def named(class_name, inside, attributes=None):
    """One instance as EnumerateInstances returns it; `inside` are its properties."""
    if attributes is None:
        attributes = f' CLASSNAME="{class_name}"'
    return (f'<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME="{class_name}">'
            '<KEYBINDING NAME="Name"><KEYVALUE VALUETYPE="string">k</KEYVALUE></KEYBINDING>'
            f'</INSTANCENAME><INSTANCE{attributes}>{inside}</INSTANCE></VALUE.NAMEDINSTANCE>')


def string_property(name, value):
    return f'<PROPERTY NAME="{name}" TYPE="string"><VALUE>{value}</VALUE></PROPERTY>'


def instances(class_name, *names):
    return "".join(named(class_name, string_property("Name", name)) for name in names)


def with_length(body, length=None):
    """A whole answer; `length` stands in the place of the true Content-Length."""
    said = str(len(body)) if length is None else length
    return HEAD + f"Content-Length: {said}\r\n\r\n".encode() + body


def chunk(octets):
    return b"%x\r\n" % len(octets) + octets + b"\r\n"


def in_chunks(body, size=200, trailer=b""):
    """A whole answer in chunks; `trailer` are whole lines."""
    pieces = b"".join(chunk(body[at:at + size]) for at in range(0, len(body), size))
    return CHUNKED + pieces + b"0\r\n" + trailer + b"\r\n"
