# SPDX-License-Identifier: GPL-3.0-or-later
"""The first start on screens of different densities."""

import desktop
import machine
from testcase import DesktopTest

WIDTH, HEIGHT = 960, 640  # of the window on a screen of 96 dpi
SCREEN_WIDTH, SCREEN_HEIGHT = 1280, 1024


class Window(DesktopTest):
    """It is larger by the factor that the screen is denser, and never larger than the screen."""

    def first_size(self, dpi):
        """In pixels of the screen."""
        machine.reset()
        display = desktop.Display()
        self.addCleanup(display.connection.close)
        display.set_density(dpi)
        self.launch()
        self.program.window(desktop.MAIN_TITLE)
        return self.program.wait(display.largest_window, lambda: "a window on the display")[2:]

    def test_has_its_own_size_on_a_usual_screen(self):
        self.assertEqual(self.first_size(96), (WIDTH, HEIGHT))

    def test_grows_by_a_factor_that_is_not_whole(self):
        self.assertEqual(self.first_size(120), (WIDTH * 5 // 4, HEIGHT * 5 // 4))

    def test_is_as_wide_as_the_screen_where_it_would_be_wider(self):
        self.assertEqual(self.first_size(144), (SCREEN_WIDTH, HEIGHT * 3 // 2))

    def test_leaves_room_for_its_title_where_it_would_be_taller_than_the_screen(self):
        width, height = self.first_size(192)
        self.assertEqual(width, SCREEN_WIDTH)
        self.assertLess(height, SCREEN_HEIGHT)
        self.assertGreater(height, SCREEN_HEIGHT * 9 // 10)
