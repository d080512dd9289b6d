// Benchmarks of the conversions against OpenCV, when it is available.
#pragma once

#include "host/plugin.h"

void RegisterOpenCvPeers(const host::Plugin &plugin);
