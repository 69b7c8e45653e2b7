-- What the job reads: psql -d survey -f control.sql, in this folder.
CREATE TABLE control (project text, number text, northing double precision, easting double precision,
                      elevation double precision, grade integer, held boolean, description text);
CREATE TEMPORARY TABLE measured (LIKE control);
ALTER TABLE measured DROP COLUMN project;
\copy measured FROM '../data/control.csv' WITH (FORMAT csv, HEADER)
INSERT INTO control SELECT 'Kestrel Bay', * FROM measured;
