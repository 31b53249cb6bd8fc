"""What tests share."""
import pathlib

import pytest

from ambrix import _core, commands
from ambrix.tests.support import manual


@pytest.fixture
def folder(tmp_path, monkeypatch):
    """An empty folder to work in, since the CDF library may leave scratch files there."""
    monkeypatch.chdir(tmp_path)
    return tmp_path


@pytest.fixture(scope="session")
def example_home(tmp_path_factory):
    """The folder with the example file of the manual."""
    home = tmp_path_factory.mktemp("example")
    with pytest.MonkeyPatch.context() as patch:
        patch.chdir(home)
        manual.Example(manual.table()).run(manual.table()["example_file"])
    return home


@pytest.fixture
def example(example_home, folder):
    """A copy of the example file."""
    path = folder / "example.cdf"
    path.write_bytes((example_home / "example.cdf").read_bytes())
    return path


@pytest.fixture(autouse=True)
def leaks():
    """No test leaves anything behind in the module, nor the library in another mode."""
    yield
    commands.setFileBackward("BACKWARDFILEOFF")
    commands.setValidate("VALIDATEFILEON")
    assert _core.leaks() == (0, 0)


def samples():
    """Real files: those of AMBRIX_SAMPLES, and those of the CDF distribution."""
    return manual.files_of("AMBRIX_SAMPLES") + manual.files_of("AMBRIX_CDF_SAMPLES")


@pytest.fixture(params=samples() or [None], ids=lambda path: path and pathlib.Path(path).name)
def sample(request):
    """Each real file in turn."""
    if request.param is None:
        pytest.skip("no real files: set AMBRIX_SAMPLES to a folder of CDF files")
    return request.param
