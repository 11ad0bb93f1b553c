#pragma once

// Whether the address sanitizer is built in. It delays the reuse of freed memory, so that resident
// memory grows.
#ifdef __has_feature
#define ORVANE_ADDRESS_SANITIZER __has_feature(address_sanitizer)
#elif defined(__SANITIZE_ADDRESS__)
#define ORVANE_ADDRESS_SANITIZER 1
#else
#define ORVANE_ADDRESS_SANITIZER 0
#endif
