"""The database file."""

import os
import sqlite3

# "clok": tells this file from other databases.
APPLICATION_ID = 0x636C6F6B
VERSION = 1


def write_database(path, rows):
    """Writes the cities: (key, city, country, zone, mobile codes, city only), sorted by key."""
    unfinished = path + ".new"
    if os.path.exists(unfinished):
        os.remove(unfinished)
    database = sqlite3.connect(unfinished, isolation_level=None)
    database.executescript(f"""
        PRAGMA page_size = 4096;
        PRAGMA application_id = {APPLICATION_ID};
        PRAGMA user_version = {VERSION};
        PRAGMA synchronous = OFF;
        CREATE TABLE city(
            key INTEGER PRIMARY KEY,
            city TEXT NOT NULL,
            country TEXT NOT NULL,
            tz_path TEXT NOT NULL,
            mcc TEXT NOT NULL,
            city_only INTEGER NOT NULL) STRICT;
        BEGIN""")
    database.executemany("INSERT INTO city VALUES(?, ?, ?, ?, ?, ?)", sorted(rows))
    database.execute("COMMIT")
    database.close()
    # Programs that have the old file open keep the old file.
    os.replace(unfinished, path)
