// What the reference host's program does, one function per command.
#pragma once

#include <cstdio>
#include <functional>

#include "host/host_record.h"
#include "host/plugin.h"

namespace host {

// Runs start-up (selector 1) and prints what it did: result, features,
// routine set, worker threads, slots patched per suite.  False on failure.
bool StartupSummary(const Plugin &plugin, HostRecord &record, std::FILE *out);

// Checks every built routine of both sets against the host's own, and every
// patched slot against the chosen set.  Returns the number of failures.
int Verify(const Plugin &plugin, HostRecord &record, std::FILE *out);

// Times the host's routine and both sets at several sizes against memcpy.
// `quick` uses small sizes only (for smoke runs).
void SpeedTable(const Plugin &plugin, std::FILE *out, bool quick);

// Best time of one call in seconds: repeats `fn` for about `budget` seconds.
double BestSeconds(const std::function<void()> &fn, double budget);

}  // namespace host
