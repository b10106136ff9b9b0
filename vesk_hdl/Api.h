#pragma once

/// Marks a class or function that the shared library exports. The library is built with hidden
/// visibility: a client cannot link to anything that lacks this mark. Clients define no macro,
/// since using an exported name needs the same attribute as exporting it.
#if defined(__GNUC__)
#define VESK_HDL_API __attribute__((visibility("default")))
#else
#define VESK_HDL_API
#endif
