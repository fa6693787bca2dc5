# SPDX-License-Identifier: Apache-2.0
"""The cockpit in the window, fed by a simulated drive."""

import unittest

from viewer_support import ViewerTest


class Cockpit(ViewerTest):
    def setUp(self):
        super().setUp()
        self.start_daemon("--scenario", "drive", "--seed", "1", technology="Orvane_LTE")

    def start_sized(self, *arguments, size=(390, 1300)):  # room below the rows of every template
        self.write("window.ini", f"[Window]\nSize=@Size({size[0]} {size[1]})\n".encode())
        return self.start_viewer("--memory", self.path("window.ini"), *arguments)

    def await_serving(self, viewer):
        viewer.await_updated()
        return viewer.await_state(lambda state: any("value" in level for level in serving(state).get("levels", [])))

    def test_from_start_to_a_level_takes_no_tap(self):
        state = self.await_serving(self.start_sized())
        self.assertEqual((state["title"], state["cockpit"]["place"]), ("Kelvasi", "card"))
        self.assertRegex(serving(state)["title"], r"^LTE")
        named = {level["name"]: level for level in serving(state).get("levels", [])}
        self.assertLess(-140, named["RSRP"]["value"])
        self.assertLess(named["RSRP"]["value"], -30)
        self.assertEqual(named["RSRP"]["unit"], "dBm")

    def test_a_level_stands_beside_no_other_cells_name(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        for _ in range(4):
            viewer.do("await-update")
            cockpit = viewer.state()["cockpit"]
            others = [cell["number"] for cell in cockpit["cells"] if "number" in cell]
            self.assertNotIn(cockpit["serving"].get("number"), others)

    def test_o_fills_the_window_and_gives_it_back(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        viewer.do("press O")
        state = viewer.state()["cockpit"]
        self.assertEqual((state["place"], state["page"]), ("full", "Cockpit"))
        self.assertTrue(any(text.startswith("RSRP, ") for text in state["texts"]), state["texts"])
        self.assertIn("Cells, dBm", state["texts"])
        for keys in ("O", "Escape"):
            viewer.do(f"press {keys}")
            self.assertEqual(viewer.state()["cockpit"]["place"], "card")
            viewer.do("press O")

    def test_in_an_open_pane_there_is_no_card(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        viewer.do("open Serving Cell Info")
        self.assertEqual(viewer.state()["cockpit"]["place"], "none")
        viewer.do("back")
        self.assertEqual(viewer.state()["cockpit"]["place"], "card")

    def test_where_there_is_room_it_stands_beside_the_panes(self):
        for size in ((1200, 700), (800, 390)):
            viewer = self.start_sized(size=size)
            self.await_serving(viewer)
            state = viewer.state()
            self.assertEqual((state["cockpit"]["place"], state["cockpit"]["page"]), ("beside", "Cockpit"))
            self.assertEqual((state["title"], state["rows"] != []), ("Kelvasi", True))
            self.assertEqual(viewer.close(), 0)

    def test_before_the_first_message_the_start_screen_is_as_it_was(self):
        self.environment["TELVON_RUNTIME_DIR"] = self.path("nobody")
        state = self.start_sized().state()
        self.assertEqual((state["rows"], state["cockpit"]["place"]), ([], "none"))
        self.assertFalse(state["cockpit"]["serving"].get("known", False))

    def test_keys_events_and_marks_have_pages(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        for keys, page in (("?", "Keys"), ("E", "Events"), ("M", "Marked")):
            viewer.do(f"press {keys}")
            self.assertEqual(viewer.state()["cockpit"]["page"], page)
            viewer.do("press Escape", "press Escape")
        self.assertEqual(len(viewer.state()["cockpit"]["marks"]), 1)


def serving(state):
    return state["cockpit"]["serving"]


if __name__ == "__main__":
    unittest.main()
