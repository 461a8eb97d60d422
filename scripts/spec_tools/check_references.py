"""What one element of a spec file says about others: counts, networks, profiles, media, bounds."""

from collections import Counter
from pathlib import Path
from typing import Iterator

from spec_tools.check_structure import Problem
from spec_tools.occurrences import Occurrence

# Count element, the element that it counts.
COUNTS = {
    "NbCustomer": "CustomerData", "NbNetworkLock": "NetworkLock", "NbSPLock": "SPLock", "NbSubsetLock": "SubsetLock",
    "NbCPLock": "CPLock", "NbMaxPDP": "MaxPDP", "NbWbAmr": "WbAmr", "NbFastDormancy": "FastDormancy",
    "NbCellBroadcastChannel": "CellBroadcastChannel", "NbAccount": "Account", "NbBookmark": "Bookmark",
    "NbQuickAccess": "QuickAccess", "NbProfileHandle": "ProfileHandle", "NbProfile": "Profile",
    "NbDataSync": "DataSync", "NbSetting": "Setting",
}
# Element, how many of it a customer file may hold.
BOUNDS = {"NetworkInfo": 270, "ProfileHandle": 50, "NetworkLock": 70, "SPLock": 70, "SubsetLock": 70, "CPLock": 70}
_MEDIA = ("Wallpaper", "RingTone", "MessageTone", "AlarmTone")
_DEFAULT_CONNECTIONS = ("ProfBrowser", "ProfMMS", "ProfIntSharing", "ProfIMS", "ProfXCAP", "ProfEmergencyIMSCall")


def count_problems(elements: list[Occurrence]) -> Iterator[Problem]:
    for element in elements:
        counted = COUNTS.get(element.tag)
        if counted is None or element.parent is None:
            continue
        number = sum(child.tag == counted for child in element.parent.children)
        if element.text != str(number):
            yield element.line, f"{element.tag} says {element.text}, there are {number} {counted}"
    for tag, most in BOUNDS.items():
        number = sum(element.tag == tag for element in elements)
        if number > most:
            yield 1, f"{number} {tag}, {most} are kept"


def network_problems(elements: list[Occurrence]) -> Iterator[Problem]:
    known = {e.child_text("NetworkName") for e in elements if e.tag == "NetworkInfo"} | {"", "default"}
    for element in elements:
        if element.tag == "NetworkName" and element.text not in known:
            yield element.line, f"NetworkName {element.text!r} is no network of this customer"


def handle_problems(elements: list[Occurrence]) -> Iterator[Problem]:
    profiles = Counter((e.child_text("NetworkName"), e.child_text("ProfileName"))
                       for e in elements if e.tag == "Profile")
    for pair, number in profiles.items():
        if number > 1:
            yield 1, f"{number} profiles of {pair[0]!r} have the name {pair[1]!r}"
    of_every_network = {name for network, name in profiles if network in ("", "default")}
    for handle in (e for e in elements if e.tag == "ProfileHandle"):
        network = handle.child_text("NetworkName")
        for child in (c for c in handle.children if c.tag in _DEFAULT_CONNECTIONS):
            if (network, child.text) not in profiles and child.text not in of_every_network:
                yield child.line, f"{child.tag} {child.text!r} is no profile of {network!r}"


def media_problems(elements: list[Occurrence], spec_root: Path) -> Iterator[Problem]:
    for element in elements:
        if element.tag not in _MEDIA:
            continue
        source = element.attributes.get("src", "")
        if not source.startswith("/") or not (spec_root / source.lstrip("/")).is_file():
            yield element.line, f"{element.tag} src {source!r} is no file of the package"
        if len(source.encode()) > 199:
            yield element.line, f"{element.tag} src has {len(source.encode())} bytes, 199 are kept"


def header_problems(elements: list[Occurrence], spec_root: Path) -> Iterator[Problem]:
    """A customer's code is what stands between the first 10 and the last 13 characters of its path."""
    for element in (e for e in elements if e.key == ("CustomerData", "CustomerDataSet")):
        source = element.attributes.get("src", "")
        if next(iter(element.attributes), "") != "src":
            yield element.line, "the first attribute of CustomerData is not src"
        code = source[10:-13] if len(source) > 23 else ""
        if source != f"/Customer/{code}/customer.xml" or not (spec_root / source.lstrip("/")).is_file():
            yield element.line, f"{source!r} names no customer file of the package"
        if not 1 <= len(code.encode()) <= 9:
            yield element.line, f"customer code {code!r} has {len(code.encode())} bytes, 1 to 9 are kept"
