"""What "explain" says of sinks that the library does not read, or not to their end: status first, and no advice."""

import json
import unittest

import explaining
import sinks

UNREAD = "the sink's extension was not read"


def resealed(edid):
    return b"".join(sinks.with_checksum(bytes(edid[at : at + 128])) for at in range(0, len(edid), 128))


def changed(edid, *places):
    """With other bytes at (place, byte) and right checksums."""
    edid = bytearray(edid)
    for place, byte in places:
        edid[place] = byte
    return resealed(edid)


def with_blocks(*tags):
    """A sink whose extensions have these tags. Those of no CEA-861 extension hold what could be timings."""
    edid = bytearray(sinks.sink(vics=[16, 4], audio=[(0x09, 0x07, 0x07)], vics_4k=[1]))
    cea = bytes(edid[128:])
    blocks = [cea if tag == 2 else sinks.with_checksum(bytes([tag]) + bytes(range(1, 128))) for tag in tags]
    return changed(bytes(edid[:128]) + b"".join(blocks), (126, len(tags)))


class SinkStatus(explaining.ExplainTest):
    whole = sinks.sink(vics=[16, 4], audio=[(0x09, 0x07, 0x07), (0x3D, 0x06, 0xC0)], vics_4k=[1])

    def explain(self, edid):
        return self.explain_json("--sink", self.write("tv.bin", edid))

    def gaps(self, edid):
        """What is said of the sink, the same in document, tables and page."""
        document = self.explain(edid)
        gaps = document["sink"]["status"]["gaps"]
        _, text, _ = self.run_program("explain", "--wide", "--sink", "tv.bin")
        _, page, _ = self.run_program("explain", "--html", "-", "--sink", "tv.bin")
        self.assertEqual(text.splitlines()[2], "status:    " + (" ".join(gaps) or "All of the sink's EDID was read."))
        for gap in gaps:
            self.assertLess(page.index(gap.replace("'", "&#39;")), page.index("Sink, platform and new EDID"))
        return gaps

    def check_unread(self, edid, gap, missing=UNREAD):
        """Rows that rest on the missing part say so; nothing is advised."""
        self.assertEqual(self.gaps(edid), [gap] if isinstance(gap, str) else gap)
        document = self.explain(edid)
        self.assertFalse(document["sink"]["status"]["complete"])
        resting = [row for row in document["decisions"] if row.get("rests_on_unread")]
        self.assertGreater(len(resting), 5)
        for row in document["decisions"]:
            self.assertEqual(missing in row["sentence"] or "malformed" in row["sentence"],
                             row.get("rests_on_unread", False), row)
            self.assertNotIn("There is no HDMI sink", row["sentence"])
            self.assertNotIn("neither the sink", row["sentence"])
        for wanted in ("4k:1", "63", "dts", "3d"):
            status, printed, _ = self.run_program("explain", "--json", "--sink", "tv.bin", "--want", wanted)
            answers = json.loads(printed)
            for answer in answers["answers"]:
                if not answer["offered"]:
                    self.assertEqual((status, answer["steps"], answer["other_ways"]), (1, [], []))
                    self.assertEqual(answer["no_way"],
                                     f"No change is advised, as {missing}: what it takes is not known.")
            self.assertEqual(answers["sink_gaps"], document["sink"]["status"]["gaps"])

    def test_all_of_it_was_read(self):
        self.assertEqual(self.gaps(self.whole), [])
        document = self.explain(self.whole)
        self.assertTrue(document["sink"]["status"]["complete"])
        self.assertEqual([(block["block"], block["kind"], block["read"]) for block in
                          document["sink"]["status"]["blocks"]],
                         [(0, "base block", True), (1, "CEA-861 extension", True)])

    def test_the_base_block_is_damaged(self):
        broken = bytearray(self.whole)
        broken[20] ^= 1
        missing = "the sink's EDID was not read"
        self.check_unread(bytes(broken), "The sink's base block was not read: its 128 bytes do not add up to 0, so at "
                                         "least one is damaged.", missing)
        self.check_unread(changed(self.whole, (0, 1)), "The sink's base block was not read: its first 8 bytes are not "
                                                       "the header of an EDID.", missing)

    def test_it_is_of_a_version_that_this_library_does_not_read(self):
        self.check_unread(changed(self.whole, (19, 2)), "The sink's base block was not read: it is EDID 1.2, and this "
                          "library reads 1.3 and later revisions of version 1 only.", "the sink's EDID was not read")

    def test_a_descriptor_of_the_base_block_is_malformed(self):
        self.check_unread(changed(self.whole, (58, 0x20)), "The sink's base block was read in part: its descriptor 1 "
                          "(tag 0xFC) has bytes 2 and 4 of 0x00 and 0x20, where this library takes 0 only. What "
                          "follows it was not read, and neither was the extension.",
                          "most of the sink's EDID was not read")

    def test_the_extension_is_damaged_or_missing(self):
        broken = bytearray(self.whole)
        broken[200] ^= 1
        self.check_unread(bytes(broken), "The sink's extension (block 1) was not read: its 128 bytes do not add up to "
                                         "0, so at least one is damaged.")
        self.check_unread(self.whole[:128], "The sink announces an extension, but only its base block was given.")

    def test_the_librarys_own_rules_are_called_so(self):
        self.check_unread(changed(self.whole, (129, 1)), "The sink's extension (block 1) was not read: it is of "
                          "revision 1, which is legal, but this library reads revision 3 only.")
        self.check_unread(changed(self.whole, (130, 122)), "The sink's extension (block 1) was not read: its detailed "
                          "timings begin at byte 122, which is legal, but this library reads them up to byte 110 only.")
        self.check_unread(changed(self.whole, (130, 200)), "The sink's extension (block 1) was not read: its detailed "
                          "timings begin at byte 200, outside of the block.")

    def test_block_1_is_of_another_kind(self):
        self.check_unread(with_blocks(0x70), "The sink's block 1 was not read: it is a DisplayID extension, which is "
                          "legal, but this library looks for a CEA-861 extension there only.")
        self.check_unread(with_blocks(0xF0, 2), [
            "The sink's block 1 was not read: it is a block map, which is legal, but this library looks for a CEA-861 "
            "extension there only; block 2 is one.",
            "Not read of the sink: block 2 (CEA-861 extension). This library reads one extension."])

    def test_a_data_block_overruns(self):
        self.check_unread(changed(self.whole, (132, 0x5F)), "The sink's extension (block 1) was read up to byte 4 "
                          "only: the data block there is longer than the collection that holds it.",
                          "the sink's extension was read in part")

    def test_blocks_after_the_first_extension_are_named_as_what_they_are(self):
        edid = with_blocks(2, 0x70)
        self.assertEqual(self.gaps(edid), ["Not read of the sink: block 2 (DisplayID extension). This library reads "
                                           "one extension."])
        document = self.explain(edid)
        self.assertTrue(document["sink"]["status"]["complete"])
        rows = [row for row in document["decisions"] if "DisplayID" in row["name"]]
        self.assertEqual([row["name"] for row in rows], ["bytes of block 2 (DisplayID extension)"])
        self.assertGreater(len(rows[0]["merged"]), 2)
        self.assertEqual([row for row in document["decisions"] if row["subject"] == "sink timing" and row not in rows],
                         [])


if __name__ == "__main__":
    unittest.main()
