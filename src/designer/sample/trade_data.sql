-- What accumulates in five years of trade. Needs the word lists of base_data.sql.

WITH RECURSIVE row (n) AS (SELECT 1 UNION ALL SELECT n + 1 FROM row WHERE n < 260)
INSERT INTO customers (id, name, street, city, country_code, account_manager_id, credit_limit,
                       is_active, customer_since, notes)
SELECT row.n, l.word || ' ' || t.word, s.word || ' ' || (1 + row.n * 31 % 140), c.word,
       c.country_code, CASE WHEN row.n % 8 <> 0 THEN 6 + row.n % 5 END,
       CASE WHEN row.n % 10 <> 0 THEN 500 + row.n * 270 % 19500 END, row.n % 12 <> 0,
       DATE('2015-01-07', '+' || (row.n * 97 % 2400) || ' days'),
       CASE row.n % 15 WHEN 1 THEN 'Pays on the last day.'
                       WHEN 6 THEN 'Delivery "by hand" only; ring twice.'
                       WHEN 11 THEN 'Prefers letters to e-mail — 100 % reliable.' END
FROM row
JOIN last_names AS l ON l.n = row.n * 3 % 29 + 1
JOIN trades AS t ON t.n = row.n * 5 % 12 + 1
JOIN streets AS s ON s.n = row.n * 4 % 11 + 1
JOIN cities AS c ON c.n = row.n * 9 % 23 + 1
ORDER BY row.n;

-- Contacts 2n - 1 and 2n are those of customer n.
WITH RECURSIVE row (n) AS (SELECT 1 UNION ALL SELECT n + 1 FROM row WHERE n < 520)
INSERT INTO contacts (id, customer_id, full_name, email, phone, birthday)
SELECT row.n, (row.n + 1) / 2, f.word || ' ' || l.word,
       CASE WHEN row.n % 7 <> 0 THEN PRINTF('contact%d@customer%d.example', row.n, (row.n + 1) / 2)
       END,
       CASE WHEN row.n % 4 <> 0 THEN PRINTF('+00 555 %06d', row.n * 7919 % 1000000) END,
       CASE WHEN row.n % 3 = 0 THEN DATE('1958-06-11', '+' || (row.n * 211 % 14000) || ' days') END
FROM row
JOIN first_names AS f ON f.n = row.n * 10 % 23 + 1
JOIN last_names AS l ON l.n = row.n * 17 % 29 + 1
ORDER BY row.n;

INSERT INTO stock (warehouse_id, product_id, quantity, reorder_level, counted_at)
SELECT w.id, p.id, (p.id * 41 + w.id * 97) % 300, 20 + p.id % 5 * 10,
       CASE WHEN (p.id + w.id) % 6 <> 0
            THEN DATETIME('2023-11-30 17:00:00', '-' || ((p.id * 19 + w.id) % 20000) || ' minutes')
       END
FROM warehouses AS w CROSS JOIN products AS p
WHERE (p.id + w.id) % 5 <> 0;

WITH RECURSIVE row (n) AS (SELECT 1 UNION ALL SELECT n + 1 FROM row WHERE n < 1800),
made (n, customer_id, ordered_at) AS (
    SELECT n, n * 73 % 260 + 1,
           DATETIME('2019-01-03 08:00:00', '+' || (n - 1) || ' days',
                    '+' || (n * 47 % 600) || ' minutes')
    FROM row)
INSERT INTO orders (id, customer_id, contact_id, employee_id, ordered_at, due_on, status)
SELECT n, customer_id, CASE WHEN n % 6 <> 0 THEN customer_id * 2 - n % 2 END, 6 + n % 10,
       ordered_at, DATE(ordered_at, '+' || (7 + n % 4 * 7) || ' days'),
       CASE WHEN n % 29 = 0 THEN 'cancelled' WHEN n > 1740 THEN 'open'
            WHEN n % 8 = 0 OR n > 1660 THEN 'shipped' ELSE 'paid' END
FROM made
ORDER BY n;

-- One to five lines an order.
WITH RECURSIVE line (n) AS (SELECT 1 UNION ALL SELECT n + 1 FROM line WHERE n < 5)
INSERT INTO order_lines (order_id, line_no, product_id, quantity, unit_price, discount)
SELECT o.id, line.n, p.id, 1 + (o.id * 5 + line.n * 7) % 24, p.unit_price,
       CASE (o.id + line.n) % 9 WHEN 0 THEN 0.1 WHEN 4 THEN 0.05 ELSE 0 END
FROM orders AS o
JOIN line ON line.n <= 1 + o.id * 3 % 5
JOIN products AS p ON p.id = (o.id * 37 + line.n * 61) % 230 + 1
ORDER BY o.id, line.n;

-- Shipment n carries the lines of order n; every seventh order goes in two parts, the second of
-- which is shipment 10000 + n.
INSERT INTO shipments (id, warehouse_id, carrier, shipped_at, delivered_on)
SELECT o.id + part.first_id, o.id % 4 + 1,
       CASE o.id % 3 WHEN 0 THEN 'Blue Van' WHEN 1 THEN 'Quick Parcel' ELSE 'Own lorry' END,
       DATETIME(o.ordered_at, '+' || (1 + o.id % 3 + part.days) || ' days'),
       CASE WHEN o.id < 1720 THEN DATE(o.ordered_at, '+' || (3 + o.id % 4 + part.days) || ' days')
       END
FROM orders AS o
JOIN (SELECT 0 AS first_id, 0 AS days UNION ALL SELECT 10000, 5) AS part
    ON part.first_id = 0 OR o.id % 7 = 0
WHERE o.status IN ('shipped', 'paid');

INSERT INTO shipment_lines (shipment_id, order_id, line_no, quantity)
SELECT s.id, l.order_id, l.line_no,
       CASE WHEN s.id > 10000 THEN l.quantity / 2
            WHEN l.order_id % 7 = 0 THEN l.quantity - l.quantity / 2
            ELSE l.quantity END
FROM order_lines AS l
JOIN shipments AS s ON s.id IN (l.order_id, l.order_id + 10000)
WHERE s.id < 10000 OR l.quantity > 1;

INSERT INTO payments (order_id, paid_on, amount, method, is_refund)
SELECT t.order_id, DATE(o.due_on, PRINTF('%+d days', o.id % 12 - 6)), t.total,
       CASE o.id % 3 WHEN 0 THEN 'transfer' WHEN 1 THEN 'card' ELSE 'direct debit' END, FALSE
FROM orders AS o
JOIN order_totals AS t ON t.order_id = o.id
WHERE o.status = 'paid'
ORDER BY o.id;

INSERT INTO payments (order_id, paid_on, amount, method, is_refund)
SELECT order_id, DATE(paid_on, '+14 days'), ROUND(-amount / 4, 2), method, TRUE
FROM payments
WHERE order_id % 40 = 3
ORDER BY order_id;

ANALYZE;
