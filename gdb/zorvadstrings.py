# SPDX-License-Identifier: MIT
"""Shows texts and string values in gdb in their text form: "abc", { "a", "b", Max }, Nil.

Reads memory alone and calls nothing in the program, so that core files and broken values can be looked at.
"""

import gdb
import gdb.printing

MIN_TEXT = " "  # of the least single value


def shown(count):
    """As many of count as gdb is to show, since objects that are not built yet count anything."""
    limit = gdb.parameter("print elements")
    return min(count, limit) if limit else count


def text_of(string):
    """The characters of a ZORString."""
    inside = int(string["mCapacity"]) == int(string["kInside"])
    start = string["mInside"][0].address if inside else string["mOutside"]
    return start.string("utf-8", "backslashreplace", shown(int(string["mLength"])))


def quoted(string):
    length = int(string["mLength"])
    return '"' + text_of(string) + '"' + ("..." if shown(length) < length else "")


def texts_of(vector):
    """The texts of a vector, quoted; places beyond its limit are not read."""
    count = min(int(vector["mTop"]), int(vector["mLimit"]))
    places = (vector["mItems"][i] for i in range(shown(count)))
    texts = [quoted(place.dereference()) if int(place) != 0 else "null" for place in places]
    return texts + ["..."] if shown(count) < count else texts


def braced(items):
    return "{ " + ", ".join(items) + " }" if items else "{ }"


def state_of(value):
    """Exact, Any, Nil or Max; a number where memory holds none of them."""
    return str(value["mState"]).split("ZorString")[-1]


def single(value):
    state = state_of(value)
    if state != "Exact":
        return state
    return "Min" if text_of(value["mText"]) == MIN_TEXT else quoted(value["mText"])


def enumerated(value):
    state = state_of(value)
    texts = texts_of(value["mTexts"]["mVector"])
    if state == "Max" and texts:
        return braced(texts + ["Max"])
    if state != "Exact":
        return state
    if len(texts) != 1:
        return braced(texts)
    return "Min" if texts[0] == '""' else texts[0]


class Printer:
    def __init__(self, form, value):
        self.form, self.value = form, value

    def to_string(self):
        try:
            return self.form(self.value)
        except gdb.MemoryError as error:
            return "<%s>" % error


def printers():
    collection = gdb.printing.RegexpCollectionPrettyPrinter("zorvadstrings")
    for name, form in (
        ("ZORString", quoted),
        ("ZORISVectorImp_String", lambda vector: braced(texts_of(vector))),
        ("ZORVadSingleString", single),
        ("ZORVadEnumString", enumerated),
    ):
        collection.add_printer(name, "^%s$" % name, lambda value, form=form: Printer(form, value))
    return collection


gdb.printing.register_pretty_printer(gdb.current_objfile(), printers(), replace=True)
