"""Engines that run the batch function on many songs. Each runs where its package is installed."""

import multiprocessing
import os
import shutil
import signal
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


@pytest.mark.parametrize("method", ["fork", "spawn"])
def test_multiprocessing(method):
    parts = [SONGS[start : start + 100] for start in range(0, len(SONGS), 100)]
    with multiprocessing.get_context(method).Pool(2) as pool:
        batches = pool.map(analyse, parts)
    assert keys_of(arrow.Table.from_batches(batches)) == EXPECTED
    with multiprocessing.get_context(method).Pool(2) as pool:
        songs = pool.map(brindle.read, SONGS[:5])
    assert [song.title for song in songs] == ["0", "1", "2", "3", "4"]


def test_duckdb_over_parquet(tmp_path):
    duckdb = pytest.importorskip("duckdb")
    parquet = pytest.importorskip("pyarrow.parquet")
    parquet.write_table(arrow.table({"text": SONGS}), tmp_path / "songs.parquet")
    with duckdb.connect() as database:
        songs = database.sql(f"select text from '{tmp_path}/songs.parquet'")
        # Older releases have it by another name.
        read = getattr(songs, "to_arrow_reader", None) or songs.fetch_record_batch
        table = arrow.Table.from_batches(
            brindle.analyse_batch(batch.column("text")) for batch in read(100)
        )
        assert keys_of(table) == EXPECTED
        parquet.write_table(table, tmp_path / "analyses.parquet")
        functions = database.sql(
            f"select c.function, count(*) from (select unnest(chords) as c from "
            f"'{tmp_path}/analyses.parquet') group by all order by all"
        ).fetchall()
    assert functions == [("dominant", 399), ("subdominant", 399), ("tonic", 399)]


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
