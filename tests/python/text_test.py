"""How texts are decoded, and where the library writes them."""

import ctypes
import os

import pytest
from raidinstrumentation.text import CAPACITY, TextBuffer, decoded


@pytest.mark.parametrize("text", ["Pellion 5i, 40 °C, 日本 🛠", "", "a & b; \x01"])
def test_plain_text_stays(text: str) -> None:
    assert decoded(text.encode()) == text


@pytest.mark.parametrize(
    ("sent", "meant"),
    [
        ("a &lt;b&gt; &amp; &quot;c&quot; &apos;d&apos;", "a <b> & \"c\" 'd'"),
        ("&#65;&#x42;&#xe9;&#8364;&#x1F6E0;&#x0010FFFF;", "ABé€🛠\U0010ffff"),
    ],
)
def test_references_are_decoded(sent: str, meant: str) -> None:
    assert decoded(sent.encode()) == meant


def test_references_are_decoded_only_once() -> None:
    assert decoded(b"&amp;lt;&#38;amp;") == "&lt;&amp;"


@pytest.mark.parametrize(
    "text",
    "& &; &nbsp; &AMP; &amp &#; &#x; &#X41; &#0; &#xD800; &#xDFFF; &#x110000; &#99999999999; &#-1; "
    "&#+1; &#6a; &#00000000000000000065; &#x0000000000041; &#\N{ARABIC-INDIC DIGIT SIX}5;".split(),
)
def test_what_is_no_reference_stays(text: str) -> None:
    assert decoded(text.encode()) == text


@pytest.mark.parametrize(
    ("sent", "meant"),
    [
        pytest.param(b"40 \xb0C", "40 \ufffdC", id="another encoding"),
        pytest.param(b"\xc0\x80", "\ufffd" * 2, id="overlong"),
        pytest.param(b"\xe0\x80\x80", "\ufffd" * 3, id="overlong"),
        pytest.param(b"\xed\xa0\x80", "\ufffd" * 3, id="surrogate"),
        pytest.param(b"\xf4\x90\x80\x80", "\ufffd" * 4, id="too large"),
        pytest.param(b"\xf0\x9f\x9bA", "\ufffdA", id="cut short"),
        pytest.param(b"\xe2\x82", "\ufffd", id="cut short by the end"),
        pytest.param(b"\xff&amp;\xfe", "\ufffd&\ufffd", id="around a reference"),
    ],
)
def test_bytes_that_are_not_utf_8_are_replaced(sent: bytes, meant: str) -> None:
    assert decoded(sent) == meant


def test_the_buffer_can_be_written_up_to_its_last_byte() -> None:
    with TextBuffer() as buffer:
        ctypes.memset(buffer.address + CAPACITY - 2, ord("x"), 1)
        assert ctypes.string_at(buffer.address + CAPACITY - 2) == b"x"


def test_the_buffer_gives_back_what_was_written_since_it_was_emptied() -> None:
    with TextBuffer() as buffer:
        ctypes.memmove(buffer.address, b"text", 5)
        assert buffer.text() == b"text"
        buffer.empty()
        assert buffer.text() == b""


def test_the_buffer_leaves_no_descriptor_and_no_mapping() -> None:
    def mappings() -> int:
        with open("/proc/self/maps", encoding="ascii") as maps:
            return sum("raidinstrumentation-text" in line for line in maps)

    descriptors = os.listdir("/proc/self/fd")
    with TextBuffer():
        assert mappings() == 1
    assert mappings() == 0
    assert os.listdir("/proc/self/fd") == descriptors
