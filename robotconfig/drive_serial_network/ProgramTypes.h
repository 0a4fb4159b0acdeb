// Program types: how a program runs (stand-alone, in a competition) and over which link.
#pragma once

struct TDeviceTypeMenuItem;

/// Program-type words by platform; the same word may mean another value on
/// another platform.
extern const TDeviceTypeMenuItem nProgramTypes[];
