"""The numbers of events: what is new, what is missing, what contradicts."""

from raidinstrumentation.continuity import NUMBERS_ASKED, Continuity, History
from raidinstrumentation.records import Event

LARGEST = 2**31 - 1


def event(number: int, message: str = "") -> Event:
    return Event(
        sequence_number=number,
        date="",
        type="",
        message_string=message,
        event_code=0,
        adapter=0,
        channel=0,
        device_id=0,
        enclosure_id=0,
        logical_drive=0,
        server_name="",
        server_address="",
    )


def news(continuity: Continuity, *numbers: int) -> list[int | range]:
    """Of a batch with these numbers the new events, by their numbers, and the gaps."""
    accepted = continuity.accept([event(number) for number in numbers])
    return [new.sequence_number if isinstance(new, Event) else new for new in accepted]


def test_each_event_is_new_once() -> None:
    continuity = Continuity(41)
    assert news(continuity, 41, 42) == [41, 42]
    assert news(continuity, 41, 42) == []
    assert news(continuity, 42, 43, 44, 44) == [43, 44]
    assert (continuity.next, continuity.last) == (45, 44)


def test_what_is_before_the_beginning_is_passed_over() -> None:
    assert news(Continuity(41), 39, 40, 41) == [41]


def test_it_goes_on_after_a_number_that_is_known() -> None:
    continuity = Continuity(42, known=41)
    assert (continuity.next, continuity.last) == (42, 41)
    assert news(continuity, 41, 42) == [42]


def test_a_gap_comes_before_the_event_behind_it() -> None:
    continuity = Continuity(1)
    assert news(continuity, 1, 2, 5, 7) == [1, 2, range(3, 5), 5, range(6, 7), 7]
    assert news(continuity, 10) == [range(8, 10), 10]
    assert news(continuity, 11) == [11]
    assert continuity.missing == (range(3, 5), range(6, 7), range(8, 10))


def test_nothing_is_missing_before_the_first_event_where_any_may_be_the_first() -> None:
    continuity = Continuity(0)
    assert news(continuity, 500, 501) == [500, 501]
    assert continuity.next == 502


def test_what_is_missing_after_a_known_number_is_told() -> None:
    assert news(Continuity(42, known=41), 44) == [range(42, 44), 44]


def test_a_batch_comes_by_its_numbers() -> None:
    assert news(Continuity(1), 2, 3, 1) == [1, 2, 3]


def test_another_event_with_the_same_number_is_new() -> None:
    continuity = Continuity(1)
    first, second, third = event(1, "a"), event(1, "b"), event(1, "c")
    assert continuity.accept([first, first, second]) == [first, second]
    assert continuity.accept([second, third, first]) == [third]


def test_an_event_that_comes_late_is_new() -> None:
    continuity = Continuity(1)
    assert news(continuity, 1, 6) == [1, range(2, 6), 6]
    assert news(continuity, 4) == [4]
    assert continuity.missing == (range(2, 4), range(5, 6))
    assert news(continuity, 2, 3, 4, 5, 5, 6) == [2, 3, 5]
    assert continuity.missing == ()
    assert news(continuity, 2, 3, 4, 5) == []


def test_a_batch_is_compared_with_what_was_seen() -> None:
    continuity = Continuity(1)
    assert continuity.compared([event(1, "a")]) is History.UNKNOWN
    continuity.accept([event(1, "a"), event(2, "b")])
    assert continuity.compared([event(2, "b"), event(3, "c")]) is History.SAME
    assert continuity.compared([event(3, "c")]) is History.UNKNOWN
    assert continuity.compared([]) is History.UNKNOWN
    assert continuity.compared([event(1, "a"), event(2, "other")]) is History.DIFFERENT


def test_another_event_beside_one_that_was_seen_contradicts_nothing() -> None:
    continuity = Continuity(1)
    continuity.accept([event(1, "a")])
    batch = [event(1, "b"), event(1, "a")]
    assert continuity.compared(batch) is History.SAME
    continuity.accept(batch)
    assert continuity.compared([event(1, "a")]) is History.SAME
    assert continuity.compared([event(1, "b")]) is History.SAME


def test_what_a_known_number_says_is_learnt() -> None:
    continuity = Continuity(8, known=7)
    assert continuity.compared([event(7, "a")]) is History.SAME
    assert continuity.accept([event(7, "a")]) == []
    assert continuity.compared([event(7, "b")]) is History.DIFFERENT


def test_what_was_seen_before_a_new_count_is_known_by_its_content() -> None:
    continuity = Continuity(1)
    old, replaced, new = event(1, "old"), event(4, "old"), event(4, "new")
    continuity.accept([old, replaced])
    continuity.begin_anew()
    assert (continuity.next, continuity.last, continuity.missing) == (1, None, ())
    assert continuity.compared([new]) is History.UNKNOWN
    assert continuity.accept([old, new]) == [range(2, 4), new]
    assert continuity.next == 5


def test_what_was_seen_before_a_new_count_contradicts_nothing() -> None:
    continuity = Continuity(1)
    continuity.accept([event(2, "old"), event(3, "the same")])
    continuity.begin_anew()
    continuity.accept([event(1), event(3, "the same"), event(4)])
    assert continuity.compared([event(2, "late")]) is History.UNKNOWN
    assert continuity.compared([event(3, "another")]) is History.DIFFERENT


def test_a_number_that_is_used_again_and_again_fills_no_memory() -> None:
    continuity = Continuity(1)
    for content in range(10_001):
        continuity.accept([event(1, str(content))])
    assert continuity.compared([event(1, "0")]) is History.DIFFERENT
    assert continuity.compared([event(1, "1")]) is History.SAME


def test_numbers_that_the_service_has_lost_are_expected_again() -> None:
    continuity = Continuity(1)
    lost, new = event(3, "lost"), event(3, "new")
    continuity.accept([event(2), lost, event(6)])
    continuity.shrink_to(2)
    assert (continuity.next, continuity.last) == (3, 2)
    assert continuity.missing == (range(1, 2),)
    assert continuity.compared([event(2), new]) is History.SAME
    assert continuity.accept([lost, new]) == [new]
    assert continuity.next == 4


def test_the_last_one_is_asked_for_again_and_what_is_missing_a_little_below() -> None:
    continuity = Continuity(1)
    assert continuity.overlapping() == 1
    news(continuity, 1, 2)
    assert continuity.overlapping() == 2
    assert not continuity.waits_for_late_events()
    news(continuity, 5)
    assert continuity.overlapping() == 3
    assert continuity.waits_for_late_events()
    news(continuity, 103)
    assert continuity.overlapping() == 4
    # From further below, nothing that is ahead would be read.
    news(continuity, 500)
    assert continuity.overlapping() == 500 - NUMBERS_ASKED + 2
    news(continuity, *range(501, 700))
    assert continuity.overlapping() == 699
    assert not continuity.waits_for_late_events()


def test_around_a_newest_number_below_the_last_both_come_if_they_are_near() -> None:
    continuity = Continuity(1)
    news(continuity, 50)
    assert continuity.around(4) == 1
    news(continuity, 250)
    assert continuity.around(249) == continuity.around(150) == 150
    assert continuity.around(149) == 149 - NUMBERS_ASKED + 1
    assert continuity.around(4) == 1


def test_where_there_is_nothing_is_not_asked_again() -> None:
    continuity = Continuity(1)
    news(continuity, 1)
    continuity.pass_over_to(103)
    assert continuity.next == continuity.overlapping() == 103
    assert news(continuity, 500) == [range(2, 500), 500]
    assert continuity.next == 501


def test_it_counts_beyond_the_largest_number() -> None:
    continuity = Continuity(LARGEST)
    assert news(continuity, LARGEST) == [LARGEST]
    assert continuity.next == LARGEST + 1
    assert news(continuity, LARGEST) == []


def test_gaps_and_contents_of_long_ago_are_forgotten() -> None:
    continuity = Continuity(1)
    news(continuity, *range(1, 40_000, 2))
    assert len(continuity.missing) == 10_000
    assert continuity.missing[-1] == range(39_998, 39_999)
    assert continuity.compared([event(1)]) is History.UNKNOWN
    assert continuity.compared([event(39_999)]) is History.SAME
