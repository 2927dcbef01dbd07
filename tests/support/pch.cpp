// SPDX-License-Identifier: MIT
// The one translation unit that the tests' shared precompiled header is built with.
