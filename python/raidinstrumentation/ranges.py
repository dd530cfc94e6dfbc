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
_NUMBER = re.compile(rb"<as:sequenceNumber(?:\s[^<>]*)?>\s*(-?\d{1,10})\s*</as:sequenceNumber")
_END = b"</m:getEventsResponse"


def request_for(first: int, last: int) -> bytes:
    """What asks for the events with these numbers, both ends included."""
    envelope = _ENVELOPE.format(first=first, last=last)
    return _REQUEST.format(length=len(envelope), envelope=envelope).encode()


def numbers_in(answer: bytes) -> list[int] | None:
    """The numbers of the events in an answer; None where any of them may be unknown."""
    numbers = [int(number) for number in _NUMBER.findall(answer)]
    is_whole = _END in answer and len(numbers) == len(_TAG.findall(answer))
    return numbers if is_whole else None
