"""Shows that CheckLayers.py finds each kind of violation, and leaves what is allowed alone."""
import os
import sys
import tempfile
import unittest

sys.path.insert(0, os.path.join(os.path.dirname(os.path.abspath(__file__)), "..", "..", "cmake"))
sys.dont_write_bytecode = True
import CheckLayers


def violations(files):
    with tempfile.TemporaryDirectory() as tree:
        for path, text in files.items():
            full = os.path.join(tree, path)
            os.makedirs(os.path.dirname(full), exist_ok=True)
            with open(full, "w", encoding="utf-8") as file:
                file.write(text)
        return list(CheckLayers.violations(tree))


class TreeIncludes(unittest.TestCase):
    def assert_refused(self, path, included):
        files = {path: f'#include "{included}"\n', included: ""}
        self.assertIn(f'{path}:1: must not include "{included}"', violations(files))

    def assert_allowed(self, path, included):
        files = {path: f'#include "{included}"\n', included: ""}
        self.assertEqual([], violations(files))

    def test_the_contract_sees_only_itself_and_the_messaging_header(self):
        self.assert_allowed("host/A.h", "host/B.h")
        self.assert_allowed("host/A.h", "frame/Provider.h")
        self.assert_refused("host/A.h", "frame/Message.h")
        self.assert_refused("host/A.h", "desktop/Desktop.h")

    def test_the_messaging_header_sees_only_the_error_class(self):
        self.assert_allowed("frame/Provider.h", "host/TarnError.h")
        self.assert_refused("frame/Provider.h", "host/Geometry.h")
        self.assert_allowed("frame/Message.h", "host/Geometry.h")

    def test_panes_see_the_contract_the_frame_and_other_panes(self):
        for folder in CheckLayers.PANES:
            self.assert_allowed(folder + "A.cpp", "host/B.h")
            self.assert_allowed(folder + "A.cpp", "frame/B.h")
            self.assert_allowed(folder + "A.cpp", "text/B.h")
            self.assert_refused(folder + "A.cpp", "desktop/Desktop.h")
            self.assert_refused(folder + "A.cpp", "desktop/drawing/Surface.h")
            self.assert_refused(folder + "A.cpp", "dialogs/B.h")

    def test_the_frame_does_not_see_panes(self):
        self.assert_refused("frame/A.h", "buttons/B.h")

    def test_the_desktop_does_not_see_panes_or_dialogs(self):
        self.assert_allowed("desktop/panes/A.cpp", "host/B.h")
        self.assert_refused("desktop/panes/A.cpp", "buttons/B.h")
        self.assert_refused("desktop/panes/A.cpp", "dialogs/B.h")
        self.assert_refused("desktop/panes/A.cpp", "frame/Message.h")

    def test_examples_see_the_headers_beside_them(self):
        beside = {"examples/a/A.h": "", "examples/a/A.cpp": '#include "A.h"\n', "tools/a/A.h": ""}
        self.assertEqual([], violations(beside))
        self.assertEqual(['tools/a/A.cpp:1: must not include "A.h"'],
                         violations(dict(beside, **{"tools/a/A.cpp": '#include "A.h"\n'})))
        self.assertEqual(['examples/b/B.cpp:1: must not include "A.h"'],
                         violations(dict(beside, **{"examples/b/B.cpp": '#include "A.h"\n'})))

    def test_programs_see_the_public_headers_of_the_desktop_only(self):
        self.assert_allowed("tools/gallery/A.cpp", "desktop/Desktop.h")
        self.assert_refused("tools/gallery/A.cpp", "desktop/panes/Glog.h")
        self.assert_refused("examples/hello/A.cpp", "desktop/windows/InputEvent.h")

    def test_an_include_that_is_not_written_from_the_top_is_found(self):
        found = violations({"host/A.h": '#include "host/Missing.h"\n'})
        self.assertEqual(['host/A.h:1: "host/Missing.h" does not exist; includes are written from the top of the tree'],
                         found)
        self.assertTrue(violations({"host/A.h": '#include "B.h"\n', "host/B.h": ""}))

    def test_a_folder_that_is_not_in_the_table_is_found(self):
        self.assertEqual(["misc/A.h: the table of layers does not know this folder"], violations({"misc/A.h": ""}))

    def test_a_tree_without_sources_is_found(self):
        self.assertEqual(1, len(violations({"README.md": ""})))

    def test_tests_may_look_into_everything(self):
        self.assertEqual([], violations({"tests/A.cpp": '#include "desktop/panes/Glog.h"\n#include <SDL.h>\n'}))


# For each library a header, a name, a place where both are allowed and one where neither is.
LIBRARIES = {
    "SDL": ("SDL.h", "SDL_Init(0)", "desktop/windows/SdlWindow.cpp", "desktop/windows/EventLoop.cpp"),
    "Cairo": ("cairo.h", "cairo_paint(c)", "desktop/drawing/A.cpp", "desktop/windows/SdlWindow.cpp"),
    "pixman": ("pixman.h", "pixman_fill(p)", "desktop/drawing/A.cpp", "desktop/panes/A.cpp"),
    "Pango": ("pango/pangocairo.h", "PangoLayout *p", "desktop/type/A.cpp", "desktop/drawing/A.cpp"),
    "fontconfig": ("fontconfig/fontconfig.h", "FcInit()", "desktop/type/A.cpp", "desktop/drawing/A.cpp"),
    "ICU": ("unicode/uchar.h", "icu::UnicodeString s", "desktop/resources/A.cpp", "buttons/A.cpp"),
    "pugixml": ("pugixml.hpp", "pugi::xml_node n", "desktop/resources/A.cpp", "dialogs/A.cpp"),
    "librsvg": ("librsvg/rsvg.h", "rsvg_handle_new()", "artwork/compiler/A.cpp", "desktop/drawing/A.cpp"),
    "CLI11": ("CLI/CLI.hpp", "CLI::App app", "tools/glogview/A.cpp", "dialogs/A.cpp"),
    "the file system": ("filesystem", "std::filesystem::path p", "dialogs/A.cpp", "text/A.cpp"),
}


class Libraries(unittest.TestCase):
    def test_each_library_is_included_in_its_own_folders_only(self):
        for library, (header, _, inside, outside) in LIBRARIES.items():
            with self.subTest(library):
                self.assertEqual([], violations({inside: f"#include <{header}>\n"}))
                self.assertEqual([f"{outside}:1: must not include {library} (<{header}>)"],
                                 violations({outside: f"#include <{header}>\n"}))

    def test_each_library_is_named_in_its_own_folders_only(self):
        for library, (_, code, inside, outside) in LIBRARIES.items():
            with self.subTest(library):
                self.assertEqual([], violations({inside: f"\n{code};\n"}))
                found = violations({outside: f"\n{code};\n"})
                self.assertEqual(1, len(found))
                self.assertTrue(found[0].startswith(f"{outside}:2: must not name {library} ("), found[0])

    def test_standard_headers_and_boost_are_allowed_everywhere(self):
        self.assertEqual([], violations({"host/A.h": "#include <vector>\n#include <boost/shared_ptr.hpp>\n"}))

    def test_a_header_that_nobody_knows_is_found(self):
        self.assertEqual(["host/A.h:1: <widgets/widgets.h> is no header that this tree knows"],
                         violations({"host/A.h": "#include <widgets/widgets.h>\n"}))


class Comments(unittest.TestCase):
    def test_names_in_comments_and_strings_do_not_count(self):
        text = '// SDL_Init\n/* cairo_paint\n */\nchar const *s = "pixman_fill";\n'
        self.assertEqual([], violations({"buttons/A.cpp": text}))

    def test_a_name_after_a_string_with_slashes_counts(self):
        self.assertEqual(1, len(violations({"buttons/A.cpp": 'char const *s = "http://a"; int i = SDL_Init(0);\n'})))

    def test_an_include_in_a_comment_does_not_count(self):
        self.assertEqual([], violations({"host/A.h": '/*\n#include "desktop/Desktop.h"\n*/\n'}))


if __name__ == "__main__":
    unittest.main()
