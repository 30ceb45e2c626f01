-- Job schema, version 1: the survey database and the raw-data storage of one job.
-- Identifiers of drawable objects carry their kind in the top six bits (id >> 26):
-- 1 point, 2 line, 3 arc, 4 circle, 16 polyline. Each kind counts up from kind << 26,
-- seeded in sqlite_sequence, and AUTOINCREMENT never hands out an identifier twice.

CREATE TABLE setting (
    section TEXT NOT NULL,
    key     TEXT NOT NULL,
    value   TEXT NOT NULL,
    PRIMARY KEY (section, key)
) WITHOUT ROWID;

CREATE TABLE symbol (
    id   INTEGER PRIMARY KEY,
    name TEXT NOT NULL UNIQUE CHECK (name <> '')
);

CREATE TABLE line_type (
    id   INTEGER PRIMARY KEY,
    name TEXT NOT NULL UNIQUE CHECK (name <> '')
);

CREATE TABLE thickness (
    id   INTEGER PRIMARY KEY,
    name TEXT NOT NULL UNIQUE CHECK (name <> '')
);

CREATE TABLE layer (
    id         INTEGER PRIMARY KEY,
    name       TEXT NOT NULL UNIQUE CHECK (name <> ''),
    colour     INTEGER NOT NULL DEFAULT 15,
    point_mark INTEGER NOT NULL DEFAULT 0,
    symbol     INTEGER NOT NULL DEFAULT 0,
    line_style INTEGER NOT NULL DEFAULT 0,
    thickness  INTEGER NOT NULL DEFAULT 0,
    locked     INTEGER NOT NULL DEFAULT 0 CHECK (locked IN (0, 1)),
    active     INTEGER NOT NULL DEFAULT 1 CHECK (active IN (0, 1))
);

CREATE TABLE point (
    id            INTEGER PRIMARY KEY AUTOINCREMENT CHECK ((id >> 26) = 1),
    name          TEXT NOT NULL UNIQUE CHECK (name <> ''),
    east          REAL NOT NULL,
    north         REAL NOT NULL,
    height        REAL,                      -- NULL: the point has no height
    code          TEXT NOT NULL DEFAULT '',
    layer_id      INTEGER REFERENCES layer (id),
    colour        INTEGER NOT NULL DEFAULT 15,
    point_mark    INTEGER NOT NULL DEFAULT 0,
    symbol        INTEGER NOT NULL DEFAULT 0,
    symbol_value1 REAL NOT NULL DEFAULT 1.0, -- symbol scale
    symbol_value2 REAL NOT NULL DEFAULT 0.0,
    symbol_value3 REAL NOT NULL DEFAULT 0.0,
    flags         INTEGER NOT NULL DEFAULT 0,
    status        INTEGER NOT NULL DEFAULT 0,
    note          TEXT NOT NULL DEFAULT ''
);
CREATE INDEX point_by_position ON point (east, north);

CREATE TABLE extra_symbol (
    point_id INTEGER NOT NULL REFERENCES point (id) ON DELETE CASCADE,
    seq      INTEGER NOT NULL,
    symbol   INTEGER NOT NULL,
    scale_x  REAL NOT NULL,
    scale_y  REAL NOT NULL,
    rotation REAL NOT NULL,
    PRIMARY KEY (point_id, seq)
) WITHOUT ROWID;

CREATE TABLE line (
    id         INTEGER PRIMARY KEY AUTOINCREMENT CHECK ((id >> 26) = 2),
    start_id   INTEGER NOT NULL REFERENCES point (id),
    end_id     INTEGER NOT NULL REFERENCES point (id),
    layer_id   INTEGER REFERENCES layer (id),
    colour     INTEGER NOT NULL DEFAULT 15,
    line_style INTEGER NOT NULL DEFAULT 0,
    thickness  INTEGER NOT NULL DEFAULT 0,
    flags      INTEGER NOT NULL DEFAULT 0,
    CHECK (start_id <> end_id)
);
CREATE INDEX line_by_start ON line (start_id);
CREATE INDEX line_by_end ON line (end_id);

CREATE TABLE arc (
    id         INTEGER PRIMARY KEY AUTOINCREMENT CHECK ((id >> 26) = 3),
    start_id   INTEGER NOT NULL REFERENCES point (id),
    end_id     INTEGER NOT NULL REFERENCES point (id),
    third_id   INTEGER NOT NULL REFERENCES point (id),
    arc_type   INTEGER NOT NULL DEFAULT 0,   -- bit 0: third point on the arc, else centre; bit 1: sense
    layer_id   INTEGER REFERENCES layer (id),
    colour     INTEGER NOT NULL DEFAULT 15,
    line_style INTEGER NOT NULL DEFAULT 0,
    thickness  INTEGER NOT NULL DEFAULT 0,
    flags      INTEGER NOT NULL DEFAULT 0,
    CHECK (start_id <> end_id AND start_id <> third_id AND end_id <> third_id)
);
CREATE INDEX arc_by_start ON arc (start_id);
CREATE INDEX arc_by_end ON arc (end_id);
CREATE INDEX arc_by_third ON arc (third_id);

CREATE TABLE circle (
    id         INTEGER PRIMARY KEY AUTOINCREMENT CHECK ((id >> 26) = 4),
    centre_id  INTEGER NOT NULL REFERENCES point (id),
    radius     REAL NOT NULL CHECK (radius > 0),
    layer_id   INTEGER REFERENCES layer (id),
    colour     INTEGER NOT NULL DEFAULT 15,
    line_style INTEGER NOT NULL DEFAULT 0,
    thickness  INTEGER NOT NULL DEFAULT 0,
    flags      INTEGER NOT NULL DEFAULT 0
);
CREATE INDEX circle_by_centre ON circle (centre_id);

CREATE TABLE polyline (
    id         INTEGER PRIMARY KEY AUTOINCREMENT CHECK ((id >> 26) = 16),
    name       TEXT NOT NULL DEFAULT '',     -- names need not be unique: a string may be kept twice
    layer_id   INTEGER REFERENCES layer (id),
    colour     INTEGER NOT NULL DEFAULT 15,
    line_style INTEGER NOT NULL DEFAULT 0,
    thickness  INTEGER NOT NULL DEFAULT 0,
    flags      INTEGER NOT NULL DEFAULT 0
);
CREATE INDEX polyline_by_name ON polyline (name);

-- The vertices are the polyline's linkage to its points: a point in use cannot be deleted.
CREATE TABLE polyline_vertex (
    polyline_id INTEGER NOT NULL REFERENCES polyline (id) ON DELETE CASCADE,
    seq         INTEGER NOT NULL,
    point_id    INTEGER NOT NULL REFERENCES point (id),
    bulge       REAL NOT NULL DEFAULT 0.0,
    PRIMARY KEY (polyline_id, seq)
) WITHOUT ROWID;
CREATE INDEX polyline_vertex_by_point ON polyline_vertex (point_id);

-- Data hung on any drawable object. The object tables remove it through the triggers below,
-- since one foreign key cannot point into five tables.
CREATE TABLE attribute (
    object_id INTEGER NOT NULL,
    seq       INTEGER NOT NULL,
    name      TEXT NOT NULL CHECK (name <> ''),
    type      TEXT NOT NULL DEFAULT '',
    value     TEXT NOT NULL DEFAULT '',
    PRIMARY KEY (object_id, seq)
) WITHOUT ROWID;

CREATE TABLE image (
    object_id INTEGER NOT NULL,
    seq       INTEGER NOT NULL,
    file      TEXT NOT NULL CHECK (file <> ''),
    number1   REAL NOT NULL DEFAULT 0.0,
    number2   REAL NOT NULL DEFAULT 0.0,
    PRIMARY KEY (object_id, seq)
) WITHOUT ROWID;

CREATE TABLE extended_data (
    object_id INTEGER NOT NULL,
    kind      INTEGER NOT NULL,              -- 2: the point note
    data      TEXT NOT NULL,
    PRIMARY KEY (object_id, kind)
) WITHOUT ROWID;

CREATE TRIGGER point_object_data AFTER DELETE ON point BEGIN
    DELETE FROM attribute WHERE object_id = old.id;
    DELETE FROM image WHERE object_id = old.id;
    DELETE FROM extended_data WHERE object_id = old.id;
END;
CREATE TRIGGER line_object_data AFTER DELETE ON line BEGIN
    DELETE FROM attribute WHERE object_id = old.id;
    DELETE FROM image WHERE object_id = old.id;
    DELETE FROM extended_data WHERE object_id = old.id;
END;
CREATE TRIGGER arc_object_data AFTER DELETE ON arc BEGIN
    DELETE FROM attribute WHERE object_id = old.id;
    DELETE FROM image WHERE object_id = old.id;
    DELETE FROM extended_data WHERE object_id = old.id;
END;
CREATE TRIGGER circle_object_data AFTER DELETE ON circle BEGIN
    DELETE FROM attribute WHERE object_id = old.id;
    DELETE FROM image WHERE object_id = old.id;
    DELETE FROM extended_data WHERE object_id = old.id;
END;
CREATE TRIGGER polyline_object_data AFTER DELETE ON polyline BEGIN
    DELETE FROM attribute WHERE object_id = old.id;
    DELETE FROM image WHERE object_id = old.id;
    DELETE FROM extended_data WHERE object_id = old.id;
END;

-- The job's own survey code library. Codes are unique without regard to case.
CREATE TABLE survey_code (
    code                TEXT NOT NULL PRIMARY KEY COLLATE NOCASE CHECK (code <> ''),
    description         TEXT NOT NULL DEFAULT '',
    layer               TEXT NOT NULL DEFAULT '',
    point_mark          TEXT NOT NULL DEFAULT '',
    symbol              TEXT NOT NULL DEFAULT '',
    point_colour        TEXT NOT NULL DEFAULT '',
    line_type           TEXT NOT NULL DEFAULT '',
    line_colour         TEXT NOT NULL DEFAULT '',
    thickness           TEXT NOT NULL DEFAULT '',
    is_string           INTEGER NOT NULL DEFAULT 0,
    use_in_surface      INTEGER NOT NULL DEFAULT 0,
    line_use_in_surface INTEGER NOT NULL DEFAULT 0,
    point_flag1         INTEGER NOT NULL DEFAULT 0,
    point_flag2         INTEGER NOT NULL DEFAULT 0,
    point_flag3         INTEGER NOT NULL DEFAULT 0,
    point_flag4         INTEGER NOT NULL DEFAULT 0
) WITHOUT ROWID;

-- Structured storage: storages nest, each holds named streams. The root has no parent.
CREATE TABLE storage (
    id        INTEGER PRIMARY KEY,
    parent_id INTEGER REFERENCES storage (id) ON DELETE CASCADE,
    name      TEXT NOT NULL,
    CHECK ((parent_id IS NULL) = (id = 1)),
    UNIQUE (parent_id, name)
);

CREATE TABLE stream (
    storage_id INTEGER NOT NULL REFERENCES storage (id) ON DELETE CASCADE,
    name       TEXT NOT NULL CHECK (name <> ''),
    data       BLOB NOT NULL,
    PRIMARY KEY (storage_id, name)
) WITHOUT ROWID;

INSERT INTO storage (id, parent_id, name) VALUES (1, NULL, '');
INSERT INTO sqlite_sequence (name, seq) VALUES
    ('point', 1 << 26), ('line', 2 << 26), ('arc', 3 << 26), ('circle', 4 << 26),
    ('polyline', 16 << 26);
