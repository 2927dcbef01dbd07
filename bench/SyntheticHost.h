// SPDX-License-Identifier: MIT
#pragma once

/**
 * Fills the kernel with measured objects of four lengths each, so that benchmarks have records without an
 * import.
 *
 * \param count number of values, a multiple of four; replaces what a former call made
 */
void fillSyntheticHost(int count);
