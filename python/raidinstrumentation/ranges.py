"""Asking for the events of any range: the request, and the numbers in its answer."""

import re

_ENVELOPE = (
    "<?xml version='1.0' ?>"
    '<env:Envelope xmlns:env="http://www.w3.org/2002/12/soap-envelope"'
    ' xmlns:xsi="http://www.w3.org/2001/XMLSchema-instance"'
    ' xmlns:xsd="http://www.w3.org/2001/XMLSchema-datatypes">'
    '<env:Body><m:getEvents xmlns:m="http://localhost/soap/v1/method"'
    ' xmlns:as="http://localhost/soap/v1/argSimple">'
    '<as:start xsi:type="xsd:int">{first}</as:start><as:end xsi:type="xsd:int">{last}</as:end>'
    "</m:getEvents></env:Body></env:Envelope>"
)
# The service takes bare line feeds, as the library sends them.
_REQUEST = (
    "POST /SOAPService/RaidMonitor HTTP/1.1\n"
    'Content-Type: application/soap+xml; charset="utf-8"\n'
    "Content-Length:{length}\n\n{envelope}"
)

_TAG = re.compile(rb"<as:sequenceNumber[\s/>]")
_ELEMENT = re.compile(rb"<as:sequenceNumber(?:\s[^<>]*)?(?:/>|>([^<]*)</as:sequenceNumber\s*>)")
# The library reads no further than here, either.
_END = re.compile(rb"</ac:events\s*>|<ac:events(?:\s[^<>]*)?/>")
_DIGITS = re.compile(rb"\s*([+-]?)0*(\d{0,11})")


def request_for(first: int, last: int) -> bytes:
    """What asks for the events with these numbers, both ends included."""
    envelope = _ENVELOPE.format(first=first, last=last)
    return _REQUEST.format(length=len(envelope), envelope=envelope).encode()


def numbers_in(answer: bytes) -> list[int] | None:
    """The numbers of the events in an answer as the library reads them; None where it may read none."""
    numbers = [_number(text) for text in _ELEMENT.findall(answer)]
    is_whole = _END.search(answer) is not None and len(numbers) == len(_TAG.findall(answer))
    return numbers if is_whole else None


def _number(text: bytes) -> int:
    """What the text begins with, or else 0; numbers of more than 32 bits are the last that there are."""
    digits = _DIGITS.match(text)
    assert digits is not None
    sign, magnitude = digits.groups()
    return max(-(2**31), min(int(sign + (magnitude or b"0")), 2**31 - 1))
