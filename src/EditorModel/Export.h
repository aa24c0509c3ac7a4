// SPDX-License-Identifier: Apache-2.0
#pragma once

/// Marks what the shared library exports; everything else in it is hidden.
#if defined(_WIN32)
#if defined(EDITORMODEL_LIBRARY)
#define EDITORMODEL_EXPORT __declspec(dllexport)
#else
#define EDITORMODEL_EXPORT __declspec(dllimport)
#endif
#else
#define EDITORMODEL_EXPORT __attribute__((visibility("default")))
#endif
