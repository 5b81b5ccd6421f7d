"""Every public object tells what it is, with an example that is run."""

import doctest
import inspect
import re

import brindle
import pytest

FLAGS = doctest.ELLIPSIS | doctest.NORMALIZE_WHITESPACE


def public_objects():
    yield "brindle", brindle
    for name in brindle.__all__:
        value = getattr(brindle, name)
        if isinstance(value, str):
            continue
        yield name, value
        if inspect.isclass(value) and not issubclass(value, Exception):
            fields = getattr(value, "__dataclass_fields__", {})
            for member, part in vars(value).items():
                if not member.startswith("_") and member not in fields:
                    yield f"{name}.{member}", part


OBJECTS = dict(public_objects())


@pytest.mark.parametrize("page", ["README.md", "docs/python.md"])
def test_what_the_documents_show_holds(page, source_folder):
    pytest.importorskip("pyarrow")
    text = (source_folder / page).read_text(encoding="utf-8")
    blocks = re.findall(r"^```pycon\n(.*?)^```", text, re.DOTALL | re.MULTILINE)
    examples = doctest.DocTestParser().get_doctest("\n".join(blocks), {}, page, None, None)
    assert examples.examples
    assert doctest.DocTestRunner(optionflags=FLAGS).run(examples).failed == 0


@pytest.mark.parametrize("name", OBJECTS)
def test_what_is_public_has_an_example_that_holds(name):
    text = inspect.getdoc(OBJECTS[name])
    assert text, f"{name} has no docstring"
    examples = doctest.DocTestParser().get_doctest(text, {}, name, None, None)
    if name != "MarkovModel.load":  # shown by save
        assert examples.examples, f"{name} has no example"
    assert doctest.DocTestRunner(optionflags=FLAGS).run(examples).failed == 0
