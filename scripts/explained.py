"""Lists of things that are as they are for a reason."""


def explained(path):
    """The reason of each entry of a list: the entries stand indented below it."""
    reasons = {}
    reason = ""
    for line in path.read_text().splitlines():
        if line.startswith("#") or not line.strip():
            continue
        if line.startswith("    "):
            reasons[line.strip()] = reason
        else:
            reason = line.strip()
    return reasons
