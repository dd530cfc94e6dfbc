#include "xml/unit_reader.h"

namespace raid::xml {

void UnitReader::passSpaceBeforeTag() noexcept { at = passSpace(at, end); }

const NamedUnit& UnitReader::readNamed(TagMemory& children) {
    const auto unit = next();
    current = {unit, children.numberOf(unit.name)};
    if (unit.opening && unit.finished && current.number >= 0) {
        children.keep({before, between(before, at)}, current);
    }
    return current;
}

}  // namespace raid::xml
