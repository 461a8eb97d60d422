"""The customers of the example package: which country each one is, and what it tries out."""

from dataclasses import dataclass, field


@dataclass(frozen=True)
class Identity:
    """What tells a network from another one of the same MCC+MNC. The values are made up."""
    msin: str = ""  # leading digits of the subscriber number, SPCode
    gid: str = ""   # group identifier, SubsetCode
    spn: str = ""   # service provider name, SPName


@dataclass(frozen=True)
class Customer:
    code: str
    country: str
    ip_version: str = "ipv4"
    roaming_ip_version: str = "ipv4"
    hidden_words: tuple[str, str] = ("show", "hidden")  # both spellings are accepted
    ims_networks: tuple[str, ...] = ()                  # get the well-known IMS profiles as well
    static_address: str = ""                            # of the second profile
    unused_fields: bool = False                         # elements that are accepted and have no effect
    identities: dict[str, Identity] = field(default_factory=dict)


CUSTOMERS = (
    Customer("XFV", "in", ip_version="ipv4v6", ims_networks=("Airtel",)),
    Customer("INS", "re", static_address="192.0.2.10", unused_fields=True),
    Customer("TFG", "es", hidden_words=("off", "on"), ims_networks=("Movistar (Telefónica)",),
             identities={
                 "Másmovil": Identity(spn="Másmovil"),
                 "Happy Móvil/moviData": Identity(spn="Happy Móvil"),
                 "LlamaYa móvil": Identity(spn="LlamaYa móvil"),
                 "Amena": Identity(gid="A3"),
                 "Tuenti Móvil": Identity(msin="98"),
                 "Pepephone": Identity(spn="Pepephone"),
             }),
    Customer("IMN", "im"),
    Customer("MCI", "ir", ip_version="ipv6"),
)
