"""What a row of the city list can show."""

import re
import unicodedata

# Of "city, country"; the rest is cut.
ROW_BYTES = 255
_NOT_FOR_ROWS = re.compile("[<>&\\x00-\\x1f\\x7f-\\x9f]")


def usable(text):
    """The text as a list row can show it, or nothing: rows are marked-up text."""
    text = unicodedata.normalize("NFC", (text or "").strip())
    return "" if _NOT_FOR_ROWS.search(text) else text


def with_state(name, state):
    return f"{name} ({state})"
