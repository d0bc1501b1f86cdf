#pragma once
// Devices as people name them at the command line.

#include <string>

#include "platform/LinkAddress.h"

namespace zel {

/// The whole path of a device in the working folder or, where none is, below /dev, whether it is
/// there or not. "COM" and what follows it stands as it is, and so does an empty name.
std::string devicePath(const std::string& name);
/// The same for the port of an address; a host of the network stays.
void useDevicePath(LinkAddress& address);

}  // namespace zel
