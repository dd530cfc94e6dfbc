#include "model/system_and_adapter.h"

#include "model/system_and_adapter_vocabulary.h"

RAIDAdapter::RAIDAdapter(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}

RAIDSystem::RAIDSystem(const char* text, int length, int* consumed) {
    raid::xml::readElement(*this, text, length, consumed);
}
