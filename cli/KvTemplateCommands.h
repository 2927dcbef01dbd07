// SPDX-License-Identifier: MIT
#pragma once

class KvCliOutput;
struct KvCliArguments;

/** The commands that need no measurements. Each returns the exit code. */
namespace KvTemplateCommands {

/** "statreport check": what a template holds and what would be skipped or refused. */
int check(const KvCliArguments &arguments, const KvCliOutput &output);
/** "statreport blocks": the block types and their settings with defaults. */
int blocks(const KvCliArguments &arguments, const KvCliOutput &output);

} // namespace KvTemplateCommands
