-- Run from this folder by the sqlite3 shell with -bail: any bad row in the
-- CSV (not a whole number, a widget icon outside 0-22, a repeated provider
-- number) fails the build instead of being skipped.
CREATE TEMP TABLE rows (icon_id, day_mapping_id, night_mapping_id);
.import --csv --skip 1 weathernews_icon.csv rows
CREATE TEMP TABLE checked (ok INTEGER CHECK (ok = 1));
INSERT INTO checked SELECT
    (SELECT COUNT(*) FROM rows) > 0
    AND NOT EXISTS (SELECT 1 FROM rows
        WHERE icon_id = '' OR icon_id GLOB '*[^0-9]*'
           OR day_mapping_id = '' OR day_mapping_id GLOB '*[^0-9]*'
           OR night_mapping_id = '' OR night_mapping_id GLOB '*[^0-9]*'
           OR CAST(day_mapping_id AS INTEGER) > 22
           OR CAST(night_mapping_id AS INTEGER) > 22)
    AND (SELECT COUNT(DISTINCT CAST(icon_id AS INTEGER)) FROM rows) = (SELECT COUNT(*) FROM rows);
CREATE TABLE icon_table (icon_id INTEGER PRIMARY KEY,
                         day_mapping_id INTEGER NOT NULL,
                         night_mapping_id INTEGER NOT NULL);
INSERT INTO icon_table SELECT CAST(icon_id AS INTEGER), CAST(day_mapping_id AS INTEGER),
                              CAST(night_mapping_id AS INTEGER) FROM rows;
