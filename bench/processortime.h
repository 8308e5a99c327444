// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

/// The milliseconds of processor time that this process has used, without those of child processes and of other
/// programs.
double processorMilliseconds();
