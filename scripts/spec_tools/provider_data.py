"""Operators of a country, from the public-domain data of mobile-broadband-provider-info."""

import hashlib
import xml.etree.ElementTree as ET
from dataclasses import dataclass, field
from pathlib import Path

DEFAULT = Path("/usr/share/mobile-broadband-provider-info/serviceproviders.xml")
# The data writes authentication as a protocol; spec files write how strong it is.
_AUTH = {"pap": "normal", "chap": "secure"}


@dataclass
class Apn:
    value: str
    name: str
    usage: str  # "internet", "wap" or "mms"
    user: str
    password: str
    auth: str
    mmsc: str
    proxy: str
    port: str
    dns: list[str] = field(default_factory=list)


@dataclass
class Provider:
    name: str
    networks: list[str]  # MCC followed by MNC
    voicemail: list[str]
    apns: list[Apn]


def checksum(path: Path) -> str:
    return hashlib.sha256(path.read_bytes()).hexdigest()


def _text(element: ET.Element, tag: str) -> str:
    return " ".join((element.findtext(tag) or "").split())


def _apn(element: ET.Element) -> Apn:
    usage = element.find("usage")
    method = element.find("authentication")
    user = _text(element, "username")
    # A name to log in with and no method means the plain one.
    auth = _AUTH[method.get("method")] if method is not None else ("normal" if user else "none")
    proxy, _, port = _text(element, "mmsproxy").partition(":")
    return Apn(value=element.get("value").strip(), name=_text(element, "name"),
               usage=usage.get("type") if usage is not None else "internet",
               user=user, password=_text(element, "password"), auth=auth, mmsc=_text(element, "mmsc"),
               proxy=proxy, port=port, dns=[" ".join(d.text.split()) for d in element.findall("dns") if d.text])


def read_country(path: Path, code: str) -> list[Provider]:
    """GSM operators in the data's order; those without a network of their own are left out."""
    providers = []
    for provider in ET.parse(path).getroot().findall(f"country[@code='{code}']/provider"):
        gsm = provider.find("gsm")
        if gsm is None or gsm.find("network-id") is None:
            continue
        networks = list(dict.fromkeys(n.get("mcc") + n.get("mnc") for n in gsm.findall("network-id")))
        providers.append(Provider(name=_text(provider, "name"), networks=networks,
                                  voicemail=[v.text.strip() for v in gsm.findall("voicemail") if v.text],
                                  apns=[_apn(a) for a in gsm.findall("apn")]))
    return providers
