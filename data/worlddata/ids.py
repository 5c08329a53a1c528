"""Message identifiers and keys: they stay the same when the data are built again."""

import hashlib
import re
import unicodedata
import zlib

MAX_BYTES = 63

# Letters that have no decomposition.
_LETTERS = str.maketrans({"ø": "o", "Ø": "O", "đ": "d", "Đ": "D", "ł": "l", "Ł": "L", "ı": "i", "ß": "ss", "æ": "ae",
                          "Æ": "AE", "œ": "oe", "Œ": "OE", "ð": "d", "Ð": "D", "þ": "th", "Þ": "Th"})


def slug(text):
    """The letters and digits of a text in capitals, words joined by underscores."""
    plain = unicodedata.normalize("NFKD", text.translate(_LETTERS)).encode("ascii", "ignore").decode()
    return re.sub(r"[^A-Z0-9]+", "_", plain.upper().replace("'", "")).strip("_")


def _limited(identifier):
    if len(identifier) <= MAX_BYTES:
        return identifier
    digest = hashlib.sha1(identifier.encode()).hexdigest()[:8].upper()
    return f"{identifier[:MAX_BYTES - len(digest) - 1]}_{digest}"


def country_id(code):
    return f"IDS_COUNTRY_{slug(code)}"


def city_id(country_code, state, name):
    # With the state even where nothing else has the name: another city of that name may come later.
    parts = ["IDS_CITY", slug(country_code), slug(state), slug(name)]
    return _limited("_".join(part for part in parts if part))


def city_keys(identifiers):
    """A number for each identifier that does not depend on which others there are, except where two meet."""
    keys, taken = {}, set()
    for identifier in sorted(identifiers):
        key = zlib.crc32(identifier.encode()) & 0x7FFFFFFF
        while key == 0 or key in taken:
            key = (key + 1) & 0x7FFFFFFF
        taken.add(key)
        keys[identifier] = key
    return keys
