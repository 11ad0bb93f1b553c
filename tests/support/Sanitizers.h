#pragma once

// Whether the address sanitizer is built in. It keeps what was freed for a while, so that memory
// seems to grow.
#ifdef __has_feature
#define ORVANE_ADDRESS_SANITIZER __has_feature(address_sanitizer)
#elif defined(__SANITIZE_ADDRESS__)
#define ORVANE_ADDRESS_SANITIZER 1
#else
#define ORVANE_ADDRESS_SANITIZER 0
#endif
