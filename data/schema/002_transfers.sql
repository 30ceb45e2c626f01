-- Job schema, version 2: the transfers into the job ("Save To Survey"), each with what it
-- wrote and everything it left out, so that a surveyor can learn later, from the job itself,
-- which strings, lines or points of a survey did not reach it and why.

CREATE TABLE transfer (
    id        INTEGER PRIMARY KEY,
    made_at   TEXT NOT NULL,                 -- UTC, YYYY-MM-DDTHH:MM:SSZ
    source    TEXT NOT NULL DEFAULT '',      -- the raw-data document or file transferred
    points    INTEGER NOT NULL DEFAULT 0,
    lines     INTEGER NOT NULL DEFAULT 0,
    arcs      INTEGER NOT NULL DEFAULT 0,
    circles   INTEGER NOT NULL DEFAULT 0,
    polylines INTEGER NOT NULL DEFAULT 0,
    complete  INTEGER NOT NULL CHECK (complete IN (0, 1))  -- 0: a failure stopped it
);

CREATE TABLE transfer_left (
    transfer_id INTEGER NOT NULL REFERENCES transfer (id) ON DELETE CASCADE,
    seq         INTEGER NOT NULL,
    kind        TEXT NOT NULL,               -- point, line, arc, circle, string, images, ...
    name        TEXT NOT NULL,
    reason      TEXT NOT NULL,
    PRIMARY KEY (transfer_id, seq)
) WITHOUT ROWID;
