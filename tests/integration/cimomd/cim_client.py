"""A small reader of CIM-XML that shares nothing with this project's own."""

import socket
import xml.etree.ElementTree as xml

from cimomd_server import body_of, call, class_name, exchange, post

# The machine's packages take a while on a busy computer.
PATIENCE_S = 120


def value_of(text, cim_type):
    if text is None:
        return None
    if cim_type.startswith(("uint", "sint")):
        return int(text)
    if cim_type == "boolean":
        return {"TRUE": True, "FALSE": False}[text]
    return text


def text_of(element):
    return None if element is None else element.text or ""


class Instance:
    """A VALUE.NAMEDINSTANCE: its path's keys as texts, its properties as values of their types."""

    def __init__(self, path, content):
        self.path = xml.tostring(path, encoding="unicode")
        self.class_name = path.get("CLASSNAME")
        self.keys = keys_of(path)
        self.properties = properties_of(content)

    def __getitem__(self, name):
        return self.properties[name]

    def get(self, name):
        return self.properties.get(name)

    def key(self):
        return tuple(sorted(self.keys.items()))

    def nulls(self):
        return {name for name, value in self.properties.items() if value is None}


def keys_of(path):
    keys = {binding.get("NAME"): text_of(binding.find("KEYVALUE"))
            for binding in path.findall("KEYBINDING")}
    if len(keys) != len(path):
        raise ValueError(f"a key twice, or something that is no key: {xml.tostring(path)}")
    return keys


def properties_of(content):
    properties = {}
    for element in content:
        name, cim_type = element.get("NAME"), element.get("TYPE")
        if element.tag == "PROPERTY":
            value = value_of(text_of(element.find("VALUE")), cim_type)
        elif element.tag == "PROPERTY.ARRAY":
            array = element.find("VALUE.ARRAY")
            value = None if array is None else [value_of(text_of(entry), cim_type)
                                                for entry in array.findall("VALUE")]
        else:
            continue
        if name in properties:
            raise ValueError(f"{name} twice in {content.get('CLASSNAME')}")
        properties[name] = value
    return properties


class CimError(Exception):
    pass


class Client:
    """Each call is a connection of its own."""

    def __init__(self, port):
        self.port = port

    def operation(self, method, parameters):
        """The elements of the answer; expat refuses one that is not well-formed."""
        with socket.create_connection(("127.0.0.1", self.port), PATIENCE_S) as connection:
            answer = exchange(connection, post(call(method, parameters)), PATIENCE_S)
        if not answer.startswith(b"HTTP/1.1 200 "):
            raise CimError(answer[:200])
        response = xml.fromstring(body_of(answer)).find("./MESSAGE/SIMPLERSP/IMETHODRESPONSE")
        error = response.find("ERROR")
        if error is not None:
            raise CimError(f"{method}: {error.get('CODE')} {error.get('DESCRIPTION')}")
        value = response.find("IRETURNVALUE")
        return [] if value is None else list(value)

    def class_names(self):
        deep = '<IPARAMVALUE NAME="DeepInheritance"><VALUE>TRUE</VALUE></IPARAMVALUE>'
        return [element.get("NAME") for element in self.operation("EnumerateClassNames", deep)]

    def superclass(self, name):
        """None for a class without one."""
        [content] = self.operation("GetClass", class_name(name))
        return content.get("SUPERCLASS")

    def instances(self, name):
        return [Instance(element.find("INSTANCENAME"), element.find("INSTANCE"))
                for element in self.operation("EnumerateInstances", class_name(name))]

    def names(self, name):
        return [keys_of(path)
                for path in self.operation("EnumerateInstanceNames", class_name(name))]

    def get(self, instance):
        """The properties that GetInstance gives for the path of `instance`."""
        [content] = self.operation(
            "GetInstance", f'<IPARAMVALUE NAME="InstanceName">{instance.path}</IPARAMVALUE>')
        return properties_of(content)
