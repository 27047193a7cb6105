// Visibility of the stand-in services. The shared library HulPlatform is built with
// hidden visibility; what its users may call carries HUL_PLATFORM_API.
#ifndef HUL_PLATFORM_EXPORT_H
#define HUL_PLATFORM_EXPORT_H

#define HUL_PLATFORM_API __attribute__((visibility("default")))

#endif
