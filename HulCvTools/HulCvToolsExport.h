// Visibility of the library's classes. libHulCvTools is built with hidden visibility;
// every exported class carries HULCV_API.
#ifndef HULCVTOOLS_HULCVTOOLSEXPORT_H
#define HULCVTOOLS_HULCVTOOLSEXPORT_H

#define HULCV_API __attribute__((visibility("default")))

#endif
