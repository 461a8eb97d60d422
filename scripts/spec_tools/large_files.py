"""Big customer files for measurements: the example's own content repeated, or plain networks and profiles."""

import xml.etree.ElementTree as ET
from pathlib import Path

from spec_tools import spec_file

EXAMPLE = Path(__file__).resolve().parents[2] / "examples/package/mps/ZEL/Customer/XFV/customer.xml"
HANDLES_MAX = 50
NETWORKS_PER_ROUND = 3


def render(element: ET.Element, depth: int) -> str:
    """As it stands in the file, less its comments."""
    indent = "  " * depth
    attributes = "".join(f' {name}="{spec_file.escape(value)}"' for name, value in element.attrib.items())
    head = f"{indent}<{element.tag}{attributes}>"
    if len(element):
        return f"{head}\n" + "".join(render(e, depth + 1) for e in element) + f"{indent}</{element.tag}>\n"
    return f"{head}{spec_file.escape((element.text or '').strip())}</{element.tag}>\n"


def _wrapped(tag: str, inner: str, depth: int) -> str:
    indent = "  " * depth
    return f"{indent}<{tag}>\n{inner}{indent}</{tag}>\n"


def _setting_groups(settings: ET.Element) -> list[str]:
    """Each a piece of `Settings` that may be repeated."""
    groups = [_wrapped("Main", render(group, 3), 2) for group in settings.find("Main")]
    return groups + [render(group, 2) for group in settings if group.tag not in ("Main", "Connections")]


class _Repeated:
    """The example taken apart; piece number i of each kind comes round again and again."""

    def __init__(self, path: Path):
        customer = ET.fromstring(path.read_bytes()[len(spec_file.MARK):]).find("CustomerData")
        connections = customer.find("Settings/Connections")
        self.networks = [render(e, 2) for e in customer.findall("GeneralInfo/NetworkInfo")]
        self.profiles = [render(e, 3) for e in connections.findall("Profile")]
        self.handles = "".join(render(e, 3) for e in connections.findall("ProfileHandle"))
        self.handle_count = len(connections.findall("ProfileHandle"))
        self.groups = _setting_groups(customer.find("Settings"))

    def document(self, rounds: int) -> bytes:
        def take(pieces: list[str], count: int) -> str:
            return "".join(pieces[i % len(pieces)] for i in range(count))

        head = "    <SalesCode>XFV</SalesCode>\n    <CountryISO>IN</CountryISO>\n"
        connections = (f"      <NbProfileHandle>{self.handle_count}</NbProfileHandle>\n{self.handles}"
                       f"      <NbProfile>{rounds}</NbProfile>\n{take(self.profiles, rounds)}")
        settings = take(self.groups, rounds) + _wrapped("Connections", connections, 2)
        body = (_wrapped("GeneralInfo", head + take(self.networks, NETWORKS_PER_ROUND * rounds), 1)
                + _wrapped("Settings", settings, 1))
        return spec_file.document(_wrapped("SW-Configuration", _wrapped("CustomerData", body, 0), 0))


def of_size(size: int) -> bytes:
    """The smallest repetition that has at least `size` bytes; one more round adds up to 8 KiB."""
    pieces = _Repeated(EXAMPLE)
    low, high = 0, 1
    while len(pieces.document(high)) < size:
        low, high = high, 2 * high
    while high - low > 1:
        middle = (low + high) // 2
        low, high = (middle, high) if len(pieces.document(middle)) < size else (low, middle)
    return pieces.document(high)


def _network_name(number: int) -> str:
    return f"Network {number:03}"


def _network(number: int) -> spec_file.Element:
    # Country code 001 belongs to test networks.
    return ("NetworkInfo", [("NetworkName", _network_name(number)), ("MCCMNC", f"001{number:03}")])


def _server(number: int) -> list[spec_file.Element]:
    """Every fourth profile goes through a proxy with a password."""
    if number % 4 != 0:
        return [("Auth", "none"), ("PSparam", [("APN", f"apn{number}.example.com")])]
    secrets = [("APN", f"apn{number}.example.com"), ("UserId", f"user{number}"), ("Password", f"secret{number}")]
    return [("Auth", "secure"), ("PSparam", secrets), ("URL", f"http://home{number}.example.com"),
            ("Proxy", [("ServAddr", "192.0.2.1"), ("Port", str(8000 + number))])]


def _profile(number: int, network: str, name: str) -> spec_file.Element:
    return ("Profile", [
        ("NetworkName", network), ("ProfileName", name), ("Editable", "yes"), ("EnableStatus", "enable"),
        ("HiddenStatus", "show"), ("RoamingEnableStatus", "disable"), ("IpVersion", "ipv4v6"),
        ("RoamingIpVersion", "ipv4"), *_server(number),
        ("StaticIP", [("EnableFlag", "off")]), ("DNS", [("EnableFlag", "off")]),
    ])


def _handle(network: str, browser: str, defaults: int) -> spec_file.Element:
    """The browser is the network's own profile, messages the first of those for every network."""
    messages = [("ProfMMS", "Everywhere 1")] if defaults else []
    return ("ProfileHandle", [("NetworkName", network), ("ProfBrowser", browser), *messages])


def _limits(networks: int) -> list[spec_file.Element]:
    """The first limit of a network stays, so those of single networks come first."""
    own = range(10, networks + 1, 10)
    items = [("MaxPDP", [("NetworkName", _network_name(i)), ("MaxPDP2G", "1"), ("MaxPDP3G", "2")]) for i in own]
    items.append(("MaxPDP", [("NetworkName", "default"), ("MaxPDP2G", "2"), ("MaxPDP3G", "4")]))
    return [("NbMaxPDP", str(len(items))), *items]


def _dormancy_item(network: str, timeout: str, screen: str, *version: spec_file.Element) -> spec_file.Element:
    return ("FastDormancy", [("NetworkName", network), ("FastDormancyEnableStatus", "on"), ("TimeoutValue", timeout),
                             ("LCDStatus", screen), *version])


def _dormancy(networks: int) -> list[spec_file.Element]:
    """Every network has both times, every tenth one more for its newer radio."""
    items = [_dormancy_item("default", "5", "on"), _dormancy_item("default", "2.5", "off")]
    items += [_dormancy_item(_network_name(i), "32.3", "on", ("Version", "rel8")) for i in range(10, networks + 1, 10)]
    return [("NbFastDormancy", str(len(items))), *items]


def of_networks(code: str, networks: int, profiles: int, defaults: int) -> bytes:
    """`defaults` of the profiles stand for every network, the others take the networks in turn."""
    elements = [_profile(i, "default", f"Everywhere {i}") for i in range(1, defaults + 1)]
    handles = []
    for i in range(profiles - defaults):
        network = _network_name(i % networks + 1)
        name = f"Internet {i + 1}"
        elements.append(_profile(defaults + i + 1, network, name))
        if i < min(networks, HANDLES_MAX):
            handles.append(_handle(network, name, defaults))
    connections = ("Connections", [("NbProfileHandle", str(len(handles))), *handles,
                                   ("NbProfile", str(len(elements))), *elements])
    customer = ("CustomerData", [
        ("GeneralInfo", [("SalesCode", code), *(_network(i) for i in range(1, networks + 1))]),
        ("Settings", [("Main", [("Network", [*_limits(networks), *_dormancy(networks)])]), connections]),
    ])
    return spec_file.document(spec_file.render(("SW-Configuration", [customer])))


def header_of(code: str) -> bytes:
    """The header of a package that has this customer only."""
    customers = ("CustomerDataSet", [("ZELName", "LARGE"), ("ZELVersion", "1"), ("NbCustomer", "1")])
    body = spec_file.render(("SW-Configuration", [customers]))
    entry = f'    <CustomerData src="/Customer/{code}/customer.xml"/>\n'
    return spec_file.document(body.replace("  </CustomerDataSet>", entry + "  </CustomerDataSet>"))
