// SPDX-License-Identifier: MIT
#pragma once

class KvBlockRegistry;

/** Registers the block types of reports, in the order of the editor's palette. */
void registerReportBlocks(KvBlockRegistry &registry);
