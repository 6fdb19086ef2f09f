"""The areas of the project, as scripts/areas.txt lists them: which files belong to each and what it builds on."""

import pathlib
import typing

ROOT = pathlib.Path(__file__).resolve().parent.parent


class Area(typing.NamedTuple):
    name: str
    builds_on: frozenset
    headers: tuple    # public headers, as paths from the root
    sources: tuple    # sources and internal headers
    tests: tuple      # test programs


def files(*patterns):
    """What matches any of the patterns, as sorted paths from the root."""
    return tuple(sorted({path.relative_to(ROOT) for pattern in patterns for path in ROOT.glob(pattern)}))


def read_areas():
    """All areas by name, in the order of the list."""
    areas = {}
    for line in (ROOT / "scripts" / "areas.txt").read_text().splitlines():
        if line.startswith("#") or not line.strip():
            continue
        name, *words = line.split()
        builds_on = [word for word in words if word in areas]
        headers = [word for word in words if word not in areas and word != "-"]
        source = "zoncore/src" if name == "core" else f"zonmediatypes/src/{name}"
        areas[name] = Area(
            name,
            frozenset(builds_on),
            files(*(word if "/" in word else f"zonmediatypes/{word}.h" for word in headers)),
            files(f"{source}/*.h", f"{source}/*.cpp"),
            tuple(path.stem for path in files(f"tests/{name}/*Test.cpp")),
        )
    return areas
