#include "Peers.h"

#include <benchmark/benchmark.h>

#if __has_include(<boost/version.hpp>)
#include <boost/version.hpp>
#endif
#if __has_include(<CLI/Version.hpp>)
#include <CLI/Version.hpp>
#endif
#if __has_include(<openssl/opensslv.h>)
#include <openssl/opensslv.h>
#endif
#if __has_include(<sodium/version.h>)
#include <sodium/version.h>
#endif
#if __has_include(<llvm/Config/llvm-config.h>)
#include <llvm/Config/llvm-config.h>
#endif

std::string describePeers() {
    std::string text = "the C++ library";
#ifdef __GLIBCXX__
    text += " of g++ " + std::to_string(_GLIBCXX_RELEASE);
#endif
#ifdef BOOST_LIB_VERSION
    text += std::string(", Boost ") + BOOST_LIB_VERSION;
#endif
#ifdef CLI11_VERSION
    text += std::string(", CLI11 ") + CLI11_VERSION;
#endif
#if __has_include(<ini.h>)
    text += ", inih";
#endif
#ifdef LLVM_VERSION_STRING
    text += std::string(", LLVM ") + LLVM_VERSION_STRING;
#endif
#ifdef SODIUM_VERSION_STRING
    text += std::string(", libsodium ") + SODIUM_VERSION_STRING;
#endif
#ifdef OPENSSL_VERSION_TEXT
    text += std::string(", ") + OPENSSL_VERSION_TEXT;
#endif
    return text;
}
