import pytest

from app_runner import Vorla


@pytest.fixture
def vorla(tmp_path):
    return Vorla(tmp_path)
