#pragma once

#include "host/session/launchedservice.h"

/**
 * The tool behind its program, which loads it when the picker's process has been started, and finds it by this name.
 * Takes over @p service. Returns the exit status.
 */
extern "C" __attribute__((visibility("default"))) int favrinColorPickerMain(int argc, char *argv[],
                                                                            favrin::host::LaunchedService *service);
