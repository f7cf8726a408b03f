// The versions of the peers.
#pragma once

#include <string>

/// The peers that this program was built with, and their versions.
std::string describePeers();
