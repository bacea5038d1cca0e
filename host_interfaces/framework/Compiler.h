// Copyright (c) 2026 The Cliphost authors
// SPDX-License-Identifier: MIT
#pragma once

// What compilers spell in different ways: the one place with their attributes.

// What a library gives to others, and what it takes from one.
#ifdef _WIN32
#define NCF_EXPORT __declspec(dllexport)
#define NCF_IMPORT __declspec(dllimport)
#else
#define NCF_EXPORT __attribute__((visibility("default")))
#define NCF_IMPORT NCF_EXPORT
#endif

// A function that formats as printf does: the numbers of its format and of its first
// value, the object itself counted. Every part of the system that MinGW builds is
// built with the ANSI formatter.
#if defined(__MINGW32__) && !defined(__clang__)
#define NCF_PRINTF(text, first) __attribute__((format(gnu_printf, text, first)))
#elif defined(__GNUC__) || defined(__clang__)
#define NCF_PRINTF(text, first) __attribute__((format(printf, text, first)))
#else
#define NCF_PRINTF(text, first)
#endif

// The id by which __uuidof knows an interface of the system.
#ifdef _MSC_VER
#define NCF_UUID(text) __declspec(uuid(text))
#else
#define NCF_UUID(text)
#endif
