# SPDX-License-Identifier: GPL-3.0-or-later
"""The size of the window on screens of different densities."""

import desktop
import machine
from testcase import DesktopTest

WIDTH, HEIGHT = 960, 640  # of the window on a screen of 96 dpi
SCREEN_WIDTH, SCREEN_HEIGHT = 1280, 1024
TOOLS = 80, 60, 400, 50  # part of the tool bar on a screen of 192 dpi


class Window(DesktopTest):
    def setUp(self):
        machine.reset()
        self.display = desktop.Display()
        self.addCleanup(self.display.connection.close)

    def open(self, dpi):
        """Starts the program on a screen of a density. The size of its window, in pixels of the screen."""
        self.display.set_density(dpi)
        self.launch()
        self.program.window(desktop.MAIN_TITLE)
        return self.size()

    def size(self):
        return self.program.wait(self.display.largest_window, lambda: "a window on the display")[2:]

    def close(self):
        self.display.ask_to_close(self.display.window_at(self.display.largest_window()))
        self.assertEqual(self.program.wait_ended(), 0)


class FirstSize(Window):
    """It is larger by the factor that the screen is denser, and never larger than the screen."""

    def test_is_its_own_on_a_usual_screen(self):
        self.assertEqual(self.open(96), (WIDTH, HEIGHT))

    def test_grows_by_a_factor_that_is_not_whole(self):
        self.assertEqual(self.open(120), (WIDTH * 5 // 4, HEIGHT * 5 // 4))

    def test_is_as_wide_as_the_screen_where_it_would_be_wider(self):
        self.assertEqual(self.open(144), (SCREEN_WIDTH, HEIGHT * 3 // 2))

    def test_leaves_room_for_its_title_where_it_would_be_taller_than_the_screen(self):
        width, height = self.open(192)
        self.assertEqual(width, SCREEN_WIDTH)
        self.assertLess(height, SCREEN_HEIGHT)
        self.assertGreater(height, SCREEN_HEIGHT * 9 // 10)


class LaterSize(Window):
    """It is the one that the window was given last."""

    def assert_kept(self, dpi, size):
        self.open(dpi)
        self.display.resize(self.display.window_at(self.display.largest_window()), *size)
        self.wait(lambda: self.size() == size, f"a window of {size}")
        self.close()
        self.assertEqual(self.open(dpi), size)

    def test_is_kept_on_a_usual_screen(self):
        self.assert_kept(96, (700, 500))

    def test_is_kept_on_a_dense_screen(self):
        self.assert_kept(144, (900, 690))

    def test_may_be_that_of_the_screen(self):
        self.assert_kept(96, (SCREEN_WIDTH, SCREEN_HEIGHT))

    def test_grows_with_the_density(self):
        self.assert_kept(96, (600, 480))
        self.close()
        self.assertEqual(self.open(192), (1200, 960))


class Icons(Window):
    def test_are_drawn_as_finely_as_the_screen_shows(self):
        self.open(192)
        x, y, *_ = self.display.largest_window()
        left, top, width, height = TOOLS
        place = desktop.Box((x + left, y + top, width, height))

        def are_fine():
            # What is merely enlarged has no line of one pixel.
            pixels = self.display.pixels(place)
            return any(one != two != three for one, two, three in zip(pixels, pixels[1:], pixels[2:]))

        self.program.wait(are_fine, lambda: "fine icons in the tool bar")
