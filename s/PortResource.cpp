#include "PortResource.h"

#include <cstdio>

#include "HkStr.h"

namespace {

template <std::size_t size>
void copyInto(char (&field)[size], const char* text) {
    if (text != field) {
        std::snprintf(field, size, "%s", text != nullptr ? text : "");
    }
}

}  // namespace

void PortResource::setPortDisplayName(const char* name) {
    copyInto(m_portDisplayName, name);
}

void PortResource::setPortName(const char* name) {
    copyInto(m_portName, name);
}
