"""Engines that run the batch function on many songs. Each runs where its package is installed."""

import multiprocessing
import os
import re
import shutil
import signal
import subprocess
import sys

import brindle
import pytest

arrow = pytest.importorskip("pyarrow")

pytestmark = pytest.mark.engine
SONGS = [f"{{title: {number}}}\n[Dm7]la [G7]la [C]la" for number in range(400)]
SONGS[7] = "what is this"


def keys_of(batch):
    return list(zip(batch.column("title").to_pylist(), batch.column("key").to_pylist()))


EXPECTED = keys_of(brindle.analyse_batch(SONGS))


def analyse(songs):
    return brindle.analyse_batch(songs, threads=1)


def run_script_of_page(page, source_folder, folder):
    """Runs the script that a page of the documents shows; gives what it prints."""
    text = (source_folder / "docs" / page).read_text(encoding="utf-8")
    script = folder / "script.py"
    script.write_text(re.search(r"^```python\n(.*?)^```", text, re.DOTALL | re.MULTILINE)[1])
    environment = {**os.environ, "PYSPARK_PYTHON": sys.executable, "SPARK_LOCAL_IP": "127.0.0.1"}
    done = subprocess.run(
        [sys.executable, script], cwd=folder, env=environment, capture_output=True, text=True
    )
    assert done.returncode == 0, done.stderr
    return done.stdout


@pytest.mark.parametrize("method", ["fork", "spawn"])
def test_multiprocessing(method):
    parts = [SONGS[start : start + 100] for start in range(0, len(SONGS), 100)]
    with multiprocessing.get_context(method).Pool(2) as pool:
        batches = pool.map(analyse, parts)
    assert keys_of(arrow.Table.from_batches(batches)) == EXPECTED
    with multiprocessing.get_context(method).Pool(2) as pool:
        songs = pool.map(brindle.read, SONGS[:5])
    assert [song.title for song in songs] == ["0", "1", "2", "3", "4"]


def test_multiprocessing_as_the_page_shows_it(source_folder, tmp_path):
    (tmp_path / "songs").mkdir()
    for number in range(3):
        (tmp_path / f"songs/{number}.txt").write_text("Dm7 G7 | C\n\nAm | E7 | Am\n")
    printed = run_script_of_page("multiprocessing.md", source_folder, tmp_path)
    assert printed.splitlines() == ["tonic 9", "dominant 6", "subdominant 3"]


def test_duckdb_as_the_page_shows_it(source_folder, tmp_path, monkeypatch):
    duckdb = pytest.importorskip("duckdb")
    parquet = pytest.importorskip("pyarrow.parquet")
    years = [1960 + number % 2 for number in range(len(SONGS))]
    songs = arrow.table({"text": SONGS, "year": years})
    parquet.write_table(songs, tmp_path / "songs.parquet")
    printed = run_script_of_page("duckdb.md", source_folder, tmp_path)
    for function in ["dominant", "subdominant", "tonic"]:
        assert re.search(rf"\b{function}\b.*\b399\b", printed)
    assert keys_of(parquet.read_table(tmp_path / "analyses.parquet")) == EXPECTED
    monkeypatch.chdir(tmp_path)
    page = (source_folder / "docs/duckdb.md").read_text(encoding="utf-8")
    (question,) = re.findall(r"^```sql\n(.*?)^```", page, re.DOTALL | re.MULTILINE)
    rows = duckdb.sql(question).fetchall()  # song 7 is of 1961 and is none
    assert rows == [(1960, "C Major", 200), (1961, "C Major", 199), (1961, None, 1)]


@pytest.fixture(scope="module")
def spark():
    pytest.importorskip("pyspark")
    if not shutil.which("java"):
        pytest.skip("Spark needs Java")
    from pyspark.sql import SparkSession

    os.environ["PYSPARK_PYTHON"] = os.environ["PYSPARK_DRIVER_PYTHON"] = sys.executable
    session = (
        SparkSession.builder.master("local-cluster[2,1,1024]")
        .config("spark.ui.enabled", "false")
        .config("spark.driver.host", "127.0.0.1")
        .config("spark.sql.execution.arrow.maxRecordsPerBatch", "20")
        .getOrCreate()
    )
    yield session
    session.stop()


@pytest.mark.parametrize("is_killed", [False, True], ids=["whole", "with a killed executor"])
def test_spark(spark, tmp_path, is_killed):
    from pyspark.sql.pandas.types import from_arrow_schema

    marker = tmp_path / "killed"

    def kill_executor_once():
        """Kills the Java machine that runs the Python worker of this task."""
        try:
            marker.touch(exist_ok=False)
        except FileExistsError:
            return
        with open(f"/proc/{os.getppid()}/stat", encoding="ascii") as stat:
            executor = int(stat.read().rsplit(")", 1)[1].split()[1])
        os.kill(executor, signal.SIGKILL)

    def analyse_partition(batches):
        for count, batch in enumerate(batches):
            if is_killed and count == 2:
                kill_executor_once()
            yield brindle.analyse_batch(batch.column("text"), threads=1)

    songs = spark.createDataFrame([(song,) for song in SONGS], "text string").repartition(4)
    schema = from_arrow_schema(brindle.batch_schema())
    rows = songs.mapInArrow(analyse_partition, schema).select("title", "key").collect()
    assert sorted((row.title, row.key or "") for row in rows) == sorted(
        (title, key or "") for title, key in EXPECTED
    )
    assert marker.exists() == is_killed


def test_spark_as_the_page_shows_it(spark, source_folder, tmp_path):
    parquet = pytest.importorskip("pyarrow.parquet")
    parquet.write_table(arrow.table({"text": SONGS}), tmp_path / "songs.parquet")
    printed = run_script_of_page("spark.md", source_folder, tmp_path)
    assert re.search(r"C Major\|\s*399\|", printed)
    rows = parquet.read_table(tmp_path / "analyses.parquet")
    assert sorted(keys_of(rows), key=str) == sorted(EXPECTED, key=str)
