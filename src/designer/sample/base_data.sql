-- What a company sets up once. The lists of words are for this script only: larger tables are
-- combined from them by arithmetic on row numbers, so that every build gives the same rows.
PRAGMA foreign_keys = ON;

CREATE TEMP TABLE first_names (n INTEGER PRIMARY KEY, word TEXT);
INSERT INTO first_names (word) VALUES
    ('Anna'), ('Bruno'), ('Chloé'), ('David'), ('Elin'), ('Filip'), ('Greta'), ('Hugo'),
    ('Inês'), ('Jonas'), ('Klára'), ('Léon'), ('Maja'), ('Nils'), ('Olga'), ('Pedro'),
    ('Ruth'), ('Søren'), ('Tomáš'), ('Ursula'), ('Vera'), ('Willem'), ('Zoë');

CREATE TEMP TABLE last_names (n INTEGER PRIMARY KEY, word TEXT);
INSERT INTO last_names (word) VALUES
    ('Almeida'), ('Berger'), ('Corti'), ('Dubois'), ('Eriksson'), ('Fischer'), ('Gómez'),
    ('Hansen'), ('Ibarra'), ('Jansen'), ('Kowalski'), ('Lindqvist'), ('Müller'), ('Novák'),
    ('Öberg'), ('Petit'), ('Rossi'), ('Šimek'), ('Taylor'), ('Vogel'), ('Weiß'), ('Younge'),
    ('Żak'), ('O''Brien'), ('Ångström'), ('Brandt'), ('Costa'), ('Díaz'), ('Evans');

CREATE TEMP TABLE trades (n INTEGER PRIMARY KEY, word TEXT);
INSERT INTO trades (word) VALUES
    ('Bakery'), ('Books'), ('Café'), ('Furniture'), ('Garden Centre'), ('Hotel'), ('Ironworks'),
    ('Office Supply'), ('Restaurant'), ('School'), ('Studio'), ('Workshop');

CREATE TEMP TABLE streets (n INTEGER PRIMARY KEY, word TEXT);
INSERT INTO streets (word) VALUES
    ('Mill Lane'), ('Station Road'), ('Harbour Street'), ('Church Square'), ('Lindenallee'),
    ('Rue du Marché'), ('Calle Mayor'), ('Kirkegata'), ('Via Nuova'), ('Dlouhá'), ('Canal Walk');

INSERT INTO countries (code, name, vat_rate) VALUES
    ('AT', 'Österreich', 20), ('BE', 'België', 21), ('CH', 'Schweiz', 8.1),
    ('CZ', 'Česko', 21), ('DE', 'Deutschland', 19), ('DK', 'Danmark', 25),
    ('ES', 'España', 21), ('FR', 'France', 20), ('GB', 'United Kingdom', 20),
    ('IT', 'Italia', 22), ('NL', 'Nederland', 21), ('NO', 'Norge', 25),
    ('PL', 'Polska', 23), ('PT', 'Portugal', 23), ('SE', 'Sverige', 25);

CREATE TEMP TABLE cities (n INTEGER PRIMARY KEY, word TEXT, country_code TEXT);
INSERT INTO cities (word, country_code) VALUES
    ('Wien', 'AT'), ('Graz', 'AT'), ('Gent', 'BE'), ('Zürich', 'CH'), ('Brno', 'CZ'),
    ('Plzeň', 'CZ'), ('Köln', 'DE'), ('Leipzig', 'DE'), ('Lübeck', 'DE'), ('Århus', 'DK'),
    ('Málaga', 'ES'), ('Vigo', 'ES'), ('Lyon', 'FR'), ('Nîmes', 'FR'), ('Leeds', 'GB'),
    ('York', 'GB'), ('Torino', 'IT'), ('Delft', 'NL'), ('Tromsø', 'NO'), ('Łódź', 'PL'),
    ('Coimbra', 'PT'), ('Malmö', 'SE'), ('Umeå', 'SE');

-- One director, four heads of department, and five people with each of them.
WITH RECURSIVE row (n) AS (SELECT 1 UNION ALL SELECT n + 1 FROM row WHERE n < 25)
INSERT INTO employees (id, full_name, title, manager_id, hired_on, salary, badge)
SELECT row.n, f.word || ' ' || l.word,
       CASE WHEN row.n = 1 THEN 'Director'
            WHEN row.n <= 5 THEN 'Head of ' ||
                CASE row.n WHEN 2 THEN 'Sales' WHEN 3 THEN 'Purchasing' WHEN 4 THEN 'Logistics'
                           ELSE 'Accounting' END
            ELSE CASE row.n % 4 WHEN 0 THEN 'Clerk' WHEN 1 THEN 'Sales Agent'
                                WHEN 2 THEN 'Buyer' ELSE 'Assistant' END END,
       CASE WHEN row.n = 1 THEN NULL WHEN row.n <= 5 THEN 1 ELSE 2 + (row.n - 6) / 5 END,
       DATE('2009-03-02', '+' || (row.n * 151 % 4400) || ' days'),
       CASE WHEN row.n = 1 THEN 9800 WHEN row.n <= 5 THEN 6200 ELSE 2900 + row.n * 37 % 1400 END,
       CASE WHEN row.n % 3 = 0 THEN CAST(PRINTF('BADGE-%04d', row.n * 613) AS BLOB) END
FROM row
JOIN first_names AS f ON f.n = row.n * 7 % 23 + 1
JOIN last_names AS l ON l.n = row.n * 11 % 29 + 1
ORDER BY row.n;

INSERT INTO categories (id, parent_id, name) VALUES
    (1, NULL, 'Kitchen'), (2, NULL, 'Office'), (3, NULL, 'Garden'), (4, NULL, 'Workshop'),
    (5, 1, 'Cookware'), (6, 1, 'Tableware'), (7, 1, 'Crème brûlée and baking'),
    (8, 2, 'Paper'), (9, 2, 'Writing'), (10, 2, 'Seating'),
    (11, 3, 'Seeds'), (12, 3, 'Tools'), (13, 4, 'Fasteners'), (14, 4, 'Measuring');

WITH RECURSIVE row (n) AS (SELECT 1 UNION ALL SELECT n + 1 FROM row WHERE n < 24)
INSERT INTO suppliers (id, name, country_code, rating, delivers_until)
SELECT row.n,
       l.word || CASE row.n % 4 WHEN 0 THEN ' & Sons' WHEN 1 THEN ' GmbH' WHEN 2 THEN ' Trading'
                                ELSE ' S.A.' END,
       c.country_code,
       CASE WHEN row.n % 6 <> 0 THEN ROUND(2.5 + row.n * 17 % 25 / 10.0, 1) END,
       CASE WHEN row.n % 5 <> 0 THEN TIME(PRINTF('%02d:30:00', 14 + row.n % 5)) END
FROM row
JOIN last_names AS l ON l.n = row.n * 13 % 29 + 1
JOIN cities AS c ON c.n = row.n * 5 % 23 + 1
ORDER BY row.n;

CREATE TEMP TABLE wares (n INTEGER PRIMARY KEY, word TEXT, category_id INTEGER);
INSERT INTO wares (word, category_id) VALUES
    ('Saucepan', 5), ('Frying Pan', 5), ('Stock Pot', 5), ('Plate', 6), ('Bowl', 6),
    ('Carafe', 6), ('Soufflé Dish', 7), ('Cake Tin', 7), ('Copy Paper', 8), ('Notebook', 8),
    ('Envelope', 8), ('Ballpoint Pen', 9), ('Fountain Pen', 9), ('Desk Chair', 10),
    ('Stool', 10), ('Sunflower Seed', 11), ('Herb Seed', 11), ('Spade', 12), ('Rake', 12),
    ('Wood Screw', 13), ('Hex Bolt', 13), ('Folding Rule', 14), ('Spirit Level', 14);

CREATE TEMP TABLE makes (n INTEGER PRIMARY KEY, word TEXT);
INSERT INTO makes (word) VALUES
    ('Basic'), ('Classic'), ('Compact'), ('Deluxe'), ('Heavy Duty'), ('Natural'), ('No. 5'),
    ('Pro'), ('Slim'), ('Travel');

INSERT INTO products (id, sku, name, category_id, supplier_id, unit_price, weight_kg,
                      is_discontinued)
SELECT id, PRINTF('%c%c-%05d', SUBSTR(UPPER(ware), 1, 1), SUBSTR(UPPER(make), 1, 1), id),
       ware || ' ' || make, category_id, id * 7 % 24 + 1,
       ROUND(1.5 + id * 379 % 9000 / 50.0, 2),
       CASE WHEN id % 9 <> 0 THEN ROUND(0.05 + id * 53 % 700 / 100.0, 2) END,
       id % 17 = 0
FROM (SELECT (w.n - 1) * 10 + m.n AS id, w.word AS ware, m.word AS make, w.category_id
      FROM wares AS w CROSS JOIN makes AS m)
ORDER BY id;

INSERT INTO warehouses (id, name, city, country_code, opens_at, closes_at) VALUES
    (1, 'North', 'Malmö', 'SE', '06:00:00', '18:00:00'),
    (2, 'Centre', 'Leipzig', 'DE', '05:30:00', '22:00:00'),
    (3, 'South', 'Lyon', 'FR', '07:00:00', '19:00:00'),
    (4, 'West', 'Vigo', 'ES', '08:00:00', '17:30:00');
