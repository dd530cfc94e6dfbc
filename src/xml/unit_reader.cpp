#include "xml/unit_reader.h"

namespace raid::xml {

void UnitReader::passSpaceBeforeTag() noexcept { at = passSpace(at, end); }

const NamedUnit& UnitReader::readNamed(TagMemory& tags) {
    const auto unit = next();
    current = {unit, tags.numberOf(unit.name)};
    if (unit.opening && unit.finished && current.number >= 0) {
        tags.keep({before, between(before, at)}, current);
    }
    return current;
}

}  // namespace raid::xml
