// What this library exports: everything else in it is hidden.
#pragma once

/// Stands before the name of a class or before a declaration. A macro, since formatters and other
/// tools take an attribute between "class" and the name for the name.
#define AMBRIX_EXPORT __attribute__((visibility("default")))
