# SPDX-License-Identifier: MIT
"""Writes a walk-through of STEPS steps over 30 controls:  large_script.py STEPS DIRECTORY

Every step changes some texts, shows one control, hides another, and leads to the next.
"""
import pathlib
import sys

steps, directory = int(sys.argv[1]), pathlib.Path(sys.argv[2])
FIRST_TEXT, TEXTS = 100001, 20
BUTTONS = range(200001, 200008)


def command(name, *parameters):
    return f"    ({name}, " + ", ".join(f'"{each}"' if isinstance(each, str) else str(each) for each in parameters) + ")"


def step(number):
    """The button Next has the tag of the step to which it leads."""
    rows = [command("SET_TEXT_FOR_OBJECT_ID", f"Step {number} of {steps}", FIRST_TEXT)]
    for text in range(1, 6):
        field = FIRST_TEXT + (number * 7 + text * 3) % (TEXTS - 1) + 1
        rows.append(command("SET_TEXT_FOR_OBJECT_ID", f"What step {number} says in row {text}", field))
    return rows + [command("SHOW_OBJECT_WITH_ID", BUTTONS[(number - 1) % len(BUTTONS)]),
                   command("HIDE_OBJECT_WITH_ID", BUTTONS[number % len(BUTTONS)]),
                   command("SET_TAG_FOR_OBJECT_ID", number + 1, number)]


lists = [f"  {number} = (\n" + ",\n".join(step(number)) + "\n  );" for number in range(1, steps + 1)]
lists.append(f"  {steps + 1} = (TERMINATE_PARSER);")
(directory / "large.plist").write_text("{\n" + "\n".join(lists) + "\n}\n")

controls = [f'  {{ class = NSTextField; tag = {FIRST_TEXT + i}; frame = ({20 + 310 * (i % 2)}, {440 - 36 * (i // 2)}, 300, 30); title = "Row {i}"; }}'
            for i in range(TEXTS)]
controls += [f'  {{ class = {"NSButton:toggle" if i % 3 == 0 else "NSButton"}; tag = {tag}; enabled = NO; frame = ({20 + 88 * i}, 60, 84, 30); title = "Tool {i}"; }}'
             for i, tag in enumerate(BUTTONS)]
controls += ['  { class = NSButton; tag = 1; frame = (530, 16, 100, 30); title = "Next"; }',
             '  { class = NSTextField; tag = 300001; frame = (20, 16, 200, 30); title = "A long walk-through"; }',
             '  { class = NSButton; tag = 300002; enabled = NO; frame = (420, 16, 100, 30); title = "Help"; }']
assert len(controls) == 30
(directory / "large-host.plist").write_text("(\n" + ",\n".join(controls) + "\n)\n")
