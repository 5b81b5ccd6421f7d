#!/usr/bin/env python3
# SPDX-License-Identifier: MIT
"""Compares the notes that `brindle import` tells with a plain reading of the XML that shares no code
with it: tools/check_import.py PROGRAM FILE...

A note is (part, onset, length, pitch) in ticks. The plain reading lets a bar end where its notes
end, joins ties by pitch and voice, and leaves grace notes out. For each file it prints how many notes
agree, and how many differ for which reason."""

import collections
import json
import subprocess
import sys
import xml.etree.ElementTree as ElementTree
import zipfile

TICKS = 960
STEPS = dict(zip("CDEFGAB", (0, 2, 4, 5, 7, 9, 11)))


def root_of(path):
    if not zipfile.is_zipfile(path):
        return ElementTree.parse(path).getroot()
    with zipfile.ZipFile(path) as archive:
        names = [n for n in archive.namelist() if not n.startswith("META-INF")]
        return ElementTree.fromstring(archive.read(names[0]))


def number(element, path, default=0.0):
    text = element.findtext(path)
    return default if text is None or not text.strip() else float(text)


def pitch_of(note, transpose):
    pitch = note.find("pitch")
    if pitch is None or pitch.findtext("step") not in STEPS:
        return None
    written = STEPS[pitch.findtext("step")] + 12 * (number(pitch, "octave") + 1)
    return int(written + number(pitch, "alter") + transpose)


def plain_notes(part):
    """The notes of a part, the lengths of its bars, and how many grace notes it has."""
    notes, open_ties, bars, graces = [], {}, [], 0
    divisions, transpose, beats = 1.0, 0.0, (4, 4)
    bar_start = 0.0
    for measure in part.findall("measure"):
        cursor = last = end = 0.0
        for element in measure:
            if element.tag == "attributes":
                divisions = number(element, "divisions", divisions)
                if element.find("transpose") is not None:
                    transpose = number(element, "transpose/chromatic") + 12 * number(
                        element, "transpose/octave-change")
                if element.find("time/beats") is not None:
                    beats = (sum(map(int, element.findtext("time/beats").split("+"))),
                             int(element.findtext("time/beat-type")))
            length = number(element, "duration") / divisions
            if element.tag == "backup":
                cursor -= length
            elif element.tag == "forward":
                cursor += length
            if element.tag == "note" and element.find("grace") is not None:
                graces += element.find("rest") is None
            elif element.tag == "note":
                onset = last if element.find("chord") is not None else cursor
                pitch = pitch_of(element, transpose)
                if pitch is not None:
                    ties = {tie.get("type") for tie in element.findall("tie")}
                    key = (pitch, element.findtext("voice"), element.findtext("staff"))
                    if "stop" in ties and key in open_ties:
                        open_ties[key][1] += length
                    else:
                        open_ties[key] = [bar_start + onset, length, pitch]
                        notes.append(open_ties[key])
                    if "start" not in ties:
                        open_ties.pop(key)
                if element.find("chord") is None and element.find("cue") is None:
                    last = cursor
                    cursor += length
            end = max(end, cursor)
        bars.append((end, 4.0 * beats[0] / beats[1]))
        bar_start += end
    ticks = lambda quarters: int(quarters * TICKS + 0.01)
    return [(ticks(o), ticks(l), p) for o, l, p in notes], bars, graces


def told_notes(program, path):
    run = subprocess.run([program, "import", path, "--format", "ndjson"], capture_output=True,
                         text=True, check=False)
    parts = []
    for line in run.stdout.splitlines():
        event = json.loads(line)
        if event["call"] == "didEncounterPartStart":
            parts.append([])
        elif event["call"] == "didEncounterNote":
            parts[-1].append(event)
    return parts, run.stderr.strip()


def shifted(notes, bars):
    """The notes moved to where bars of full length put them."""
    moved = []
    for onset, length, pitch in notes:
        start = full_start = 0.0
        for end, full in bars:
            if onset < (start + end) * TICKS - 1:
                break
            start, full_start = start + end, full_start + full
        moved.append((round(onset + (full_start - start) * TICKS), length, pitch))
    return moved


def compare(path, program):
    told, error = told_notes(program, path)
    if error:
        return f"not imported: {error}"
    found = collections.Counter()
    for part, events in zip(root_of(path).findall("part"), told):
        plain, bars, graces = plain_notes(part)
        ours = collections.Counter()
        for event in events:
            if event.get("mIsGraceNote"):
                found["grace notes, which the plain reading leaves out"] += 1
            elif event.get("mNoteType") != "pitched" or "mNoteNr" not in event:
                found["notes without pitch, which the plain reading leaves out"] += 1
            else:
                ours[(event["mPositionAsMidiTicks"], event.get("mLengthAsMidiTicks"),
                      event["mNoteNr"])] += 1
        readings = {"equal": collections.Counter(plain),
                    "equal but for bars, which all have full length": collections.Counter(
                        shifted(plain, bars))}
        name, reading = max(readings.items(), key=lambda item: sum((item[1] & ours).values()))
        found[name] += sum((ours & reading).values())
        found["only told by the import"] += sum((ours - reading).values())
        found["only in the plain reading"] += sum((reading - ours).values())
        for note in sorted((ours - reading).elements(), key=str)[:5]:
            print("  import only", note)
        for note in sorted((reading - ours).elements())[:5]:
            print("  plain only ", note)
    return ", ".join(f"{count} {what}" for what, count in found.items() if count)


def main():
    program, *files = sys.argv[1:]
    for path in files:
        print(f"{path.rsplit('/', 1)[-1]}: {compare(path, program)}")


if __name__ == "__main__":
    main()
