#include "Role.h"

#include <cstdlib>
#include <cstring>
#include <map>

namespace {

std::map<std::string, Role::Body>& roles() {
    static std::map<std::string, Role::Body> instance;
    return instance;
}

}  // namespace

Role::Role(const char* name, Body body) {
    roles()[name] = body;
}

void Role::playIfAsked(int argc, char** argv) {
    if (argc < 3 || std::strcmp(argv[1], "--role") != 0) {
        return;
    }
    const auto found = roles().find(argv[2]);
    std::exit(found != roles().end() ? found->second({argv + 3, argv + argc}) : 2);
}
