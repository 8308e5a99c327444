// SPDX-License-Identifier: GPL-3.0-or-later
#pragma once

/// Whether a command may start: not while another one's dialog or box is open. The keyboard and the mouse cannot reach
/// the window's actions then, but a desktop's global menu and a screen reader's "press" do.
bool mayStartCommand();
