#pragma once

/// Marks what the shared library exports; everything else is hidden.
#if defined(__GNUC__)
#define VESK_HDL_API __attribute__((visibility("default")))
#else
#define VESK_HDL_API
#endif
