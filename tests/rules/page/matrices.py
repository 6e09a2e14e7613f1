"""The matrices that the tests show: a head unit's, one with hostile names, and large ones."""

FILES = ["base.json", "interruptions.json"]


def reason(behavior, kind, text, line=None, pointer=None):
    where = {} if line is None else {"file": 1, "line": line, "column": 13, "pointer": pointer}
    return {"behavior": behavior, "kind": kind, "text": text, **where}


BUILT_IN = reason("Allow", "none", "neither a rule nor a default: Allow is built in")


def runs(indices):
    """A row of indices of reasons, each followed by how often it comes in succession."""
    row = []
    for index in indices:
        if row and row[-2] == index:
            row[-1] += 1
        else:
            row += [index, 1]
    return row


def kind_of(name):
    if name == "(any other)":
        return "other"
    return "wildcard" if "*" in name else "popup"


def matrix(names, reasons, choose, blocked=None):
    """`choose` gives the index of the reason for a popup in front and a requested one."""
    return {
        "title": "interruptions.json",
        "files": FILES,
        "popups": [{"name": name, "kind": kind_of(name)} for name in names],
        "reasons": reasons,
        "rows": [runs([choose(front, requested) for requested in names]) for front in names],
        "blocked": [
            (blocked or {}).get(name, {"domains": [], "views": []}) for name in names
        ],
    }


MODULES = {
    "phone": ("call", "ended", "lost", "message"),
    "car": ("fuel", "fault", "parking", "door", "tyre"),
    "media": ("volume", "source", "lost"),
    "navigation": ("traffic", "advert", "arrival", "lost"),
    "system": ("voice", "update", "power", "language"),
    "climate": ("fan", "seat", "filter"),
}

HEAD_UNIT_REASONS = [
    BUILT_IN,
    reason("Prohibit", "default", 'default of the entry "phone/call"', 4, "/0/default"),
    reason("AllowStack", "rule", 'rule for "car/*" in the entry "phone/call"', 6,
           "/0/interruptions/0"),
    reason("AllowNoReturn", "rule", 'rule for "phone/ended" in the entry "phone/call"', 7,
           "/0/interruptions/1"),
    reason("Allow", "rule", 'rule for "media/volume" in the entry "phone/call"', 8,
           "/0/interruptions/2"),
    reason("AllowNoReturn", "default", 'default of the entry "phone/*"', 14, "/1/default"),
    reason("Prohibit", "rule", 'rule for "system/*" in the entry "car/*"', 20,
           "/2/interruptions/0"),
    reason("AllowStack", "rule", 'rule for "phone/call" in the entry "car/*"', 21,
           "/2/interruptions/1"),
    reason("Allow", "default", 'default of the entry "car/*"', 18, "/2/default"),
    reason("invalid", "default", 'default "Alow" of the entry "climate/*"', 30, "/3/default"),
    reason("AllowStack", "default", 'default of the entry "system/*"', 36, "/4/default"),
]

HEAD_UNIT_BLOCKED = {
    "navigation/advert": {
        "domains": ["Phone", "Navigation"],
        "domainReason": reason("", "", 'domain blacklist of the entry "navigation/advert"', 40,
                               "/5/domainBlacklist"),
        "views": ["Navigation/Map"],
        "viewReason": reason("", "", 'view blacklist of the entry "navigation/advert"', 41,
                             "/5/viewBlacklist"),
    },
}


def head_unit_reason(front, requested):
    module = requested.split("/")[0]
    if front == "phone/call":
        rules = {"phone/ended": 3, "media/volume": 4}
        return 2 if module == "car" else rules.get(requested, 1)
    if front.startswith("car/"):
        return 6 if module == "system" else 7 if requested == "phone/call" else 8
    return {"phone": 5, "climate": 9, "system": 10}.get(front.split("/")[0], 0)


def head_unit():
    """30 rows and columns: 23 popups of six modules, the rest of each module, and all others."""
    names = []
    for module, popups in MODULES.items():
        names += [f"{module}/{popup}" for popup in popups] + [f"{module}/*"]
    names.append("(any other)")
    return matrix(names, HEAD_UNIT_REASONS, head_unit_reason, HEAD_UNIT_BLOCKED)


HOSTILE_NAMES = (
    '<img src=x onerror="window.hacked=1">',
    "</script><script>window.hacked=1</script>",
    "\"quoted\" 'twice' & &amp; \\",
    "@MATRIX_SCRIPT@ $& $1",
    "\u05d4\u05d5\u05d3\u05e2\u05d4/\u05d7\u05d3\u05e9\u05d4",
    "\u202eturned/around",
    "\U0001f697/\U0001f50b\ufe0f",
    "module/" + "long" * 50,
    " spaced  out/\ttab",
    "__proto__/constructor",
)


def hostile():
    """Each text that may hold anything holds HTML."""
    html = HOSTILE_NAMES[0]
    rule = reason("Prohibit", "rule", f'rule for "{html}"', 3, f"/0/{html}")
    blacklist = {"domains": [html], "domainReason": rule, "views": [html], "viewReason": rule}
    data = matrix(HOSTILE_NAMES, [rule], lambda front, requested: 0,
                  {name: blacklist for name in HOSTILE_NAMES})
    return {**data, "title": html, "files": ["base.json", html]}


def large(size):
    names = [f"module{index // 12:03}/popup{index % 12:02}" for index in range(size)]
    place = {name: index for index, name in enumerate(names)}
    count = len(HEAD_UNIT_REASONS)
    return matrix(names, HEAD_UNIT_REASONS,
                  lambda front, requested: (place[front] // 12 + place[requested] // 7) % count)
