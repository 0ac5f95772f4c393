"""The files that a run for /SMS writes for the two scripts of these tests, byte for byte."""


def _attribute(name, number, kind, value):
    return ("      Start Attribute\r\n"
            f"         Name = \"{name}\"\r\n"
            f"         Id = {number}\r\n"
            f"         Type = {kind}\r\n"
            f"         Value = {value}\r\n"
            "      End Attribute\r\n")


def mif(title, values, row):
    """A file with the attribute Index and one string attribute per value."""
    text = "String(64)"
    names = ["Name"] + [f"Name{number}" for number in range(3, len(values) + 2)]
    columns = [_attribute("Index", 1, "Integer", "1")]
    for number, (name, value) in enumerate(zip(names, values), 2):
        columns.append(_attribute(name, number, text, f'"{value}"'))
    return ("Start Component\r\n"
            "   Name = \"Machine\"\r\n"
            "\r\n"
            "   Start Group\r\n"
            f"      Name = \"{title}\"\r\n"
            f"      Class = \"Corvane-Velt|KWX MIF {title}|001\"\r\n"
            "      Key = 1\r\n" + "\r\n".join(columns) +
            "   End Group\r\n"
            "\r\n"
            "   Start Table\r\n"
            f"      Name = \"{title}\"\r\n"
            f"      Class = \"Corvane-Velt|KWX MIF {title}|001\"\r\n"
            "      Id = 2\r\n"
            f"      {{ 1, {row}}}\r\n"
            "\r\n"
            "   End Table\r\n"
            "End Component\r\n").encode()


# Script a asks for a class of which the server may speak wrongly, then for CIM_Fan with the one
# instance "f1"; script b asks for CIM_Fan alone.
EARLIER = b"earlier\r\n"
WHOLE = mif("a", ["x1", "f1"], '"x1","f1"')
DROPPED = mif("a", ["f1"], '"f1"')
# The list of CIM_Fan takes the place of the one that is missing, as the product wants it.
EMPTY = mif("a", ["f1", ""], '"f1",')
NEXT = mif("b", ["f1"], '"f1"')
