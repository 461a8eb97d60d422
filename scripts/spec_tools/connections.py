"""Networks, profiles and default connections of a customer, as elements of its spec file."""

from spec_tools.customers import Customer, Identity
from spec_tools.provider_data import Apn, Provider
from spec_tools.spec_file import Element

# APN names that all operators share; the providers' data does not list them.
_IMS_PROFILES = (("ProfIMS", "IMS", "ims"), ("ProfXCAP", "XCAP", "hos"), ("ProfEmergencyIMSCall", "Emergency", "sos"))


def network_elements(customer: Customer, providers: list[Provider]) -> list[Element]:
    elements = []
    for provider in providers:
        identity = customer.identities.get(provider.name, Identity())
        for mccmnc in provider.networks:
            fields = [("NetworkName", provider.name), ("MCCMNC", mccmnc), ("SPCode", identity.msin),
                      ("SubsetCode", identity.gid), ("SPName", identity.spn)]
            elements.append(("NetworkInfo", [f for f in fields if f[1]]))
    return elements


def _profile_names(provider: Provider) -> list[str]:
    """One name each: a default connection finds its profile by name."""
    names = []
    for apn in provider.apns:
        name = apn.name or (f"{provider.name} MMS" if apn.usage == "mms" else provider.name)
        if name in names:
            name = f"{name} ({apn.value})"
        number = 2
        unique = name
        while unique in names:
            unique, number = f"{name} {number}", number + 1
        names.append(unique)
    return names


def _profile(customer: Customer, network: str, name: str, apn: Apn, place: int) -> Element:
    is_mms = apn.usage == "mms"
    static = customer.static_address if place == 1 else ""
    shown, hidden = customer.hidden_words
    # From the third internet profile on, one is only there to be switched on by hand.
    usable = "enable" if is_mms or place < 2 else "disable"
    parameters = [("APN", apn.value), ("UserId", apn.user), ("Password", apn.password)]
    extra = []
    if customer.unused_fields:
        parameters.append(("TrafficClass", "background"))
        extra = [("Gateway", [("ServAddr", "0.0.0.0")]), ("SecureConn", "off"), ("LingerTime", "300")]
    protocol = [("Protocol", "wap2")] if customer.unused_fields else []
    proxy = [("Proxy", [("ServAddr", apn.proxy)] + ([("Port", apn.port)] if apn.port else []))] if apn.proxy else []
    url = [("URL", apn.mmsc)] if apn.mmsc else []
    return ("Profile", [
        ("NetworkName", network), ("ProfileName", name), ("Editable", "no" if is_mms else "yes"),
        ("EnableStatus", usable), ("HiddenStatus", hidden if apn.usage == "ims" else shown),
        ("RoamingEnableStatus", "enable" if place == 0 or is_mms else "disable"),
        ("IpVersion", "ipv4" if is_mms else customer.ip_version), ("RoamingIpVersion", customer.roaming_ip_version),
        ("Auth", apn.auth), ("PSparam", [p for p in parameters if p[1] or p[0] == "APN"]),
        *protocol, *url, *proxy, *extra,
        ("StaticIP", [("EnableFlag", "on"), ("IPAddr", static)] if static else [("EnableFlag", "off")]),
        ("DNS", [("EnableFlag", "on" if apn.dns else "off")] + [("IPAddr", d) for d in apn.dns[:2]]),
    ])


def _ims_apn(value: str) -> Apn:
    return Apn(value=value, name="", usage="ims", user="", password="", auth="none", mmsc="", proxy="", port="")


def _network_connections(customer: Customer, provider: Provider) -> tuple[Element, list[Element]]:
    """The default connections of one operator and its profiles."""
    names = _profile_names(provider)
    internet = [n for n, a in zip(names, provider.apns) if a.usage == "internet"]
    mms = [n for n, a in zip(names, provider.apns) if a.usage == "mms"]
    handle = [("NetworkName", provider.name)]
    handle += [("ProfBrowser", n) for n in internet[:1]]
    handle += [("ProfMMS", n) for n in mms[:1]]
    handle += [("ProfIntSharing", n) for n in internet[1:2]]
    profiles = []
    place = 0
    for name, apn in zip(names, provider.apns):
        profiles.append(_profile(customer, provider.name, name, apn, place))
        place += apn.usage != "mms"
    if provider.name in customer.ims_networks:
        handle += [(tag, f"{provider.name} {label}") for tag, label, _ in _IMS_PROFILES]
        profiles += [_profile(customer, provider.name, f"{provider.name} {label}", _ims_apn(value), 0)
                     for _, label, value in _IMS_PROFILES]
    return ("ProfileHandle", handle), profiles


def connections_element(customer: Customer, providers: list[Provider]) -> Element:
    """Default connections come first: a profile's category is decided when it is read."""
    handles, profiles = [], []
    for provider in providers:
        if provider.apns:
            handle, own = _network_connections(customer, provider)
            handles.append(handle)
            profiles += own
    return ("Connections", [("NbProfileHandle", str(len(handles))), *handles,
                            ("NbProfile", str(len(profiles))), *profiles])
