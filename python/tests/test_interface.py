"""The public names: each documented, and the type stubs in step with the module."""

import ast
import pathlib

import redavudeva


def stub_names():
    """Top-level names of the stubs, and the members each class declares."""
    tree = ast.parse(pathlib.Path(redavudeva._redavudeva.__file__).with_name("_redavudeva.pyi").read_text())
    names = {}
    for node in tree.body:
        if isinstance(node, (ast.FunctionDef, ast.ClassDef)):
            members = names.setdefault(node.name, set())
            for item in getattr(node, "body", []):
                if isinstance(item, ast.FunctionDef):
                    members.add(item.name)
                elif isinstance(item, ast.AnnAssign):
                    members.add(item.target.id)
    return names


def public_members(cls):
    return {name for name in vars(cls) if not name.startswith("_")} | {"__len__"} & set(vars(cls))


def test_every_public_name_is_documented_and_in_the_stubs():
    stubs = stub_names()
    assert set(redavudeva.__all__) == set(stubs)
    for name in redavudeva.__all__:
        item = getattr(redavudeva, name)
        assert (item.__doc__ or "").strip(), name
        if isinstance(item, type) and not issubclass(item, Exception):
            assert public_members(item) == stubs[name], name
            for member in public_members(item):
                assert (getattr(item, member).__doc__ or "").strip(), f"{name}.{member}"
    assert {"code", "path", "table", "line"} <= stubs["ChartError"]
