# SPDX-License-Identifier: Apache-2.0
"""The cockpit in the window, fed by a simulated drive."""

import os
import re
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

    def test_search_opens_the_pane_at_the_row(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        self.await_row(viewer, "Connected mode LTE Intra-frequency Measurement", "Serving Filtered RSRP")
        viewer.do("press /", "type serving filtered rsrp")
        self.assertRegex(viewer.state()["cockpit"]["texts"][1], r"^Serving Filtered RSRP, -\d+\.\d\d dBm, ")
        viewer.do("press Return")
        state = viewer.state()
        self.assertEqual(state["title"], "Connected mode LTE Intra-frequency Measurement")
        self.assertEqual(state["cockpit"]["place"], "none")
        viewer.do("press *")  # goes to the row at which the keyboard is
        self.assertEqual([pin["name"] for pin in viewer.state()["cockpit"]["pins"]], ["Serving Filtered RSRP"])

    def test_search_says_where_there_is_no_such_row(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        viewer.do("press /", "type no such thing")
        self.assertEqual(viewer.state()["cockpit"]["texts"], ["No row with this name or value"])

    def test_a_pin_stands_on_top_is_remembered_and_goes(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        self.await_row(viewer, "Serving Cell Info", "Cell Identity")
        viewer.do("open Serving Cell Info", "press Home", "press Space")
        state = viewer.state()["cockpit"]
        self.assertEqual((state["place"], state["texts"][0].split(",")[0]), ("full", "Value"))
        self.choose(viewer, "Pin to the cockpit")
        viewer.do("press Escape")
        texts = viewer.state()["cockpit"]["texts"]
        [pin] = viewer.state()["cockpit"]["pins"]
        self.assertLess(texts.index("Pins"), texts.index("Cells, dBm"))
        self.assertTrue(any(text.startswith(pin["name"] + ", ") for text in texts), texts)
        self.assertEqual(viewer.close(), 0)

        again = self.start_viewer("--memory", self.path("window.ini"))
        self.await_serving(again)
        self.assertEqual([kept["name"] for kept in again.state()["cockpit"]["pins"]], [pin["name"]])
        self.await_row(again, "Serving Cell Info", "Cell Identity")
        again.do("open Serving Cell Info", "press Home", "press *")
        self.assertEqual(again.state()["cockpit"]["pins"], [])

    def await_row(self, viewer, pane, name):
        """Panes get what has come with the next update only; what is searched and pinned may be ahead of them."""
        viewer.do("root", f"open {pane}")
        viewer.await_state(lambda state: any(row[0] == name for row in state["rows"]))
        viewer.do("root")

    def choose(self, viewer, text):
        """Goes to a line of the page that can be opened, by keyboard, and opens it."""
        for _ in range(60):
            viewer.do("press Down")
            if re.fullmatch(text, viewer.state()["cockpit"]["selected"]):
                return viewer.do("press Return")
        return self.fail(f"there is no {text!r}")

    def test_coverage_says_what_came_in_and_was_not_shown(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        viewer.do("press C")
        state = viewer.state()["cockpit"]
        self.assertEqual(state["page"], "Coverage")
        self.assertRegex(state["texts"][0], r"^[\d,]+ messages, (every one shown|.* not shown)$")
        viewer.do("press Escape")
        self.choose(viewer, r"[\d,]+ messages.*")
        self.assertEqual(viewer.state()["cockpit"]["page"], "Coverage")

    def save_chart(self, viewer, what):
        viewer.do("press O", "press G", "press S")
        self.assertEqual(viewer.state()["cockpit"]["page"], "Save chart")
        self.choose(viewer, what)
        return viewer.await_state(lambda state: state["notice"])["notice"]

    def test_a_chart_is_saved_as_a_picture(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        notice = self.save_chart(viewer, r"As a picture \(PNG\)")
        self.assertEqual(notice["message"], "Chart saved")
        self.assertRegex(notice["path"], r"/Chart \d{4}-\d\d-\d\d at \d\d\.\d\d\.\d\d\.png$")
        self.assertEqual(os.path.dirname(notice["path"]), self.path("snapshots"))
        self.assertEqual(self.read(notice["path"])[:8], b"\x89PNG\r\n\x1a\n")
        self.assertEqual(os.stat(notice["path"]).st_mode & 0o777, 0o600)

    def test_a_chart_is_saved_as_values(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        notice = self.save_chart(viewer, r"As values \(CSV\)")
        head, *lines = self.read(notice["path"]).decode().split("\r\n")
        self.assertRegex(head, r"^time,PCI \d+ RSRP minimum \(dBm\),PCI \d+ RSRP mean \(dBm\),")
        self.assertRegex(lines[0], r"^\d{4}-\d\d-\d\dT\d\d:\d\d:\d\dZ,-\d+")
        self.assertEqual(os.stat(notice["path"]).st_mode & 0o777, 0o600)

    def test_a_chart_that_cannot_be_written_is_told(self):
        self.environment["KELVASI_LOG_DIRECTORY"] = self.path("nowhere")
        viewer = self.start_sized()
        self.await_serving(viewer)
        viewer.do("press O", "press G", "press S")
        self.choose(viewer, r"As values \(CSV\)")
        self.assertEqual(viewer.await_state(lambda state: state["alert"])["alert"]["title"], "File Error")

    def test_the_keyboard_reads_a_chart_at_two_moments(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        viewer.do("press O", "press G", "press .", "press <")
        texts = viewer.state()["cockpit"]["texts"]
        self.assertEqual(len([text for text in texts if text.startswith("at ")]), 2, texts)
        viewer.do("press Home")
        texts = viewer.state()["cockpit"]["texts"]
        self.assertEqual([text for text in texts if text.startswith("at ")], [])

    def test_the_list_of_keys_names_every_key_of_the_cockpit(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        viewer.do("press ?")
        listed = " ".join(viewer.state()["cockpit"]["texts"])
        for keys in ("O", "/", "G", "E", "A", "C", "M", "?", "*", "Space", "Enter", "Home", "S", "<, >", "comma", "Ctrl+S",
                     "F11", "Ctrl+W", "Esc"):
            self.assertIn(", " + keys, listed)

    def test_keys_events_and_marks_have_pages(self):
        viewer = self.start_sized()
        self.await_serving(viewer)
        for keys, page in (("?", "Keys"), ("E", "Events"), ("M", "Marked"), ("C", "Coverage"), ("A", "Alarms")):
            viewer.do(f"press {keys}")
            self.assertEqual(viewer.state()["cockpit"]["page"], page)
            viewer.do("press Escape", "press Escape")
        self.assertEqual(len(viewer.state()["cockpit"]["marks"]), 1)


def serving(state):
    return state["cockpit"]["serving"]


if __name__ == "__main__":
    unittest.main()
