-- SPDX-FileCopyrightText: The Olvane developers
-- SPDX-License-Identifier: MIT

-- A small family for the examples that read databases; the same statements for SQLite and PostgreSQL.
CREATE TABLE person (
    id INTEGER PRIMARY KEY,
    father INTEGER,
    mother INTEGER,
    sex CHAR(1),
    dead INTEGER NOT NULL,
    birth TEXT,
    death TEXT,
    name TEXT NOT NULL
);
CREATE TABLE couple (
    id INTEGER PRIMARY KEY,
    husband INTEGER,
    wife INTEGER,
    state TEXT,
    day TEXT
);
INSERT INTO person VALUES (1, NULL, NULL, 'M', 1, '1809-02-12', '1882-04-19', 'Charles Darwin');
INSERT INTO person VALUES (2, NULL, NULL, 'F', 1, '1808-05-02', '1896-10-02', 'Emma Wedgwood');
INSERT INTO person VALUES (3, 1, 2, 'M', 1, '1839-12-27', '1914-04-08', 'William Erasmus Darwin');
INSERT INTO person VALUES (4, 1, 2, 'F', 1, '1843-09-25', '1927-12-17', 'Henrietta Emma Darwin');
INSERT INTO person VALUES (5, 1, 2, 'M', 1, '1845-07-09', '1912-12-07', 'George Howard Darwin');
INSERT INTO couple VALUES (1, 1, 2, 'married', '1839-01-29');
