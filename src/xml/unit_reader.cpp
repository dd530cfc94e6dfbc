#include "xml/unit_reader.h"

namespace raid::xml {

const NamedUnit& UnitReader::readNamed(const Names& names) {
    const auto unit = next();
    current = {unit, names.numberOf(unit.name)};
    if (!traced && unit.isTag && unit.finished) {
        memory.keep({before, between(before, at)}, names, current);
    }
    return current;
}

}  // namespace raid::xml
