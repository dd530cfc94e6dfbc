"""Documents as the service sends them."""

_ENVELOPE = (
    "<?xml version='1.0' ?>"
    '<env:Envelope xmlns:env="http://www.w3.org/2002/12/soap-envelope"'
    ' xmlns:xsi="http://www.w3.org/2001/XMLSchema-instance"'
    ' xmlns:xsd="http://www.w3.org/2001/XMLSchema-datatypes">'
    "<env:Body>{}</env:Body></env:Envelope>"
)


def configuration(adapters: str) -> str:
    """The answer that holds these adapters."""
    return _response("getConfigResponse", _complex("system", "o:System", adapters))


def adapter(kind: str, **fields: object) -> str:
    """An adapter of a type such as "o:LSIAdapter"."""
    return _complex("adapter", kind, _simple(**fields))


def newest_event(number: object) -> str:
    """The answer that names the newest event."""
    return _response("getNewestEventResponse", _element("as:return", "xsd:int", number))


def events(*numbers: int, message: str = "event") -> str:
    """The answer that holds events with these numbers."""
    listed = (
        _complex("event", "o:Event", _simple(sequenceNumber=number, string=f"{message} {number}"))
        for number in numbers
    )
    return _response("getEventsResponse", _complex("events", "o:Events", "".join(listed)))


def _response(method: str, content: str) -> str:
    response = (
        f'<m:{method} xmlns:m="http://localhost/soap/v1/method"'
        ' xmlns:as="http://localhost/soap/v1/argSimple"'
        f' xmlns:ac="http://localhost/soap/v1/argComplex">{content}</m:{method}>'
    )
    return _ENVELOPE.format(response)


def _simple(**fields: object) -> str:
    return "".join(_element(f"as:{key}", "xsd:string", value) for key, value in fields.items())


def _complex(name: str, kind: str, content: str) -> str:
    return _element(f"ac:{name}", kind, content)


def _element(name: str, kind: str, content: object) -> str:
    return f'<{name} xsi:type="{kind}">{content}</{name}>'
