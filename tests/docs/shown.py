"""Arrays as the notation of the examples writes them; what is long is cut short."""
import struct

MOST_CELLS = 4
MOST_CHARACTERS = 60


def shown(array):
    """The array as it would be written."""
    if array.class_name == "cell":
        texts = [shown(item) for item in array.data]
        more = f"; ... }}, {len(texts)} cells" if texts[MOST_CELLS:] else "}"
        return "{" + "; ".join(texts[:MOST_CELLS]) + more
    if array.class_name == "char" and array.size[0] < 2 and len(array.size) == 2:
        return _shown_text(array.data)
    items = [_shown_item(item, array.class_name) for item in array.data]
    text = _shown_matrix(items, array.size)
    plain = array.class_name in ("double", "logical", "char")
    return text if plain else f"{array.class_name} ({text})"


def _shown_text(text):
    line = text.split("\n")[0] if len(text) < MOST_CHARACTERS else text.strip().split("\n")[0]
    return f"'{text}'" if line == text else f"'{line}' ... , {len(text)} characters"


def _shown_item(item, class_name):
    if class_name == "char":
        return f"'{item}'"
    if isinstance(item, bool):
        return "true" if item else "false"
    if class_name == "single":
        item = _shortest_single(item)
    integral = abs(item) < 2**63 and item == int(item)  # neither is true of NaN
    return str(int(item)) if integral else repr(item)


def _shortest_single(item):
    if item != item or abs(item) == float("inf"):
        return item
    return next(short for short in (float(f"{item:.{digits}g}") for digits in range(1, 18))
                if struct.pack("f", short) == struct.pack("f", item))


def _shown_matrix(items, size):
    if size in ([1, 1], [0, 0]):
        return items[0] if items else "[]"
    if len(size) > 2:
        return f"reshape ([{', '.join(items)}], {size})"
    if not items:
        return f"zeros ({size[0]}, {size[1]})"
    rows = (", ".join(items[row::size[0]]) for row in range(size[0]))
    return "[" + "; ".join(rows) + "]"
