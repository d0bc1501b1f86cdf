#pragma once
// A failure at run time with a number and a source of its own.

#include <cstdint>
#include <stdexcept>
#include <string>
#include <utility>

#include "support/RootDebug.h"

namespace zel {

struct RunTimeError : std::runtime_error {
    RunTimeError(std::int32_t failureNumber, std::string failureSource,
                 const std::string& description)
        : std::runtime_error(description),
          number(failureNumber),
          source(std::move(failureSource)) {}
    std::int32_t number;
    std::string source;
};

/// The exception that is being handled: its number, else 5; its source, else "ZELRemote". Call it
/// inside a catch alone.
RuntimeFailure currentFailure();

}  // namespace zel
