"""Mobile country codes."""

import os
import re
import xml.etree.ElementTree as xml

PROVIDERS = "mobile-broadband-provider-info/serviceproviders.xml"


def read_mobile_codes(packages):
    """The mobile country codes of each country, in ascending order."""
    codes = {}
    for country in xml.parse(os.path.join(packages, PROVIDERS)).getroot().iter("country"):
        own = codes.setdefault((country.get("code") or "").upper(), set())
        own.update(network.get("mcc") for network in country.iter("network-id"))
    return {country: sorted(code for code in own if re.fullmatch("[0-9]{3}", code or ""))
            for country, own in codes.items()}
