// Symbol visibility for the Redavudeva library.
//
// Only CSwatchlogFactory and CColorPatch are exported. Everything else is
// reached through the object the factory returns and its virtual operations.
#pragma once

#if defined(REDAVUDEVA_STATIC)
#define REDAVUDEVA_API
#elif defined(_WIN32)
#if defined(REDAVUDEVA_BUILDING)
#define REDAVUDEVA_API __declspec(dllexport)
#else
#define REDAVUDEVA_API __declspec(dllimport)
#endif
#else
#define REDAVUDEVA_API __attribute__((visibility("default")))
#endif
