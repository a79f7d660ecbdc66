#ifndef ALDERMOOR_EXPORT_H
#define ALDERMOOR_EXPORT_H

/// Marks what the shared library offers to applications; everything else stays hidden in it.
#define ALDERMOOR_EXPORT __attribute__((visibility("default")))

#endif  // ALDERMOOR_EXPORT_H
