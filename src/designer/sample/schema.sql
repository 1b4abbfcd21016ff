-- A small trading company: who buys, what is sold, where it lies, how it gets there.
PRAGMA page_size = 4096;
PRAGMA encoding = 'UTF-8';

CREATE TABLE countries (
    code TEXT PRIMARY KEY NOT NULL,
    name TEXT NOT NULL UNIQUE,
    vat_rate DECIMAL(4, 2) NOT NULL
) WITHOUT ROWID;

CREATE TABLE employees (
    id INTEGER PRIMARY KEY,
    full_name TEXT NOT NULL,
    title TEXT NOT NULL,
    manager_id INTEGER REFERENCES employees (id),
    hired_on DATE NOT NULL,
    salary DECIMAL(10, 2) NOT NULL,
    badge BLOB
);

CREATE TABLE customers (
    id INTEGER PRIMARY KEY,
    name TEXT NOT NULL,
    street TEXT NOT NULL,
    city TEXT NOT NULL,
    country_code TEXT NOT NULL REFERENCES countries,
    account_manager_id INTEGER REFERENCES employees (id),
    credit_limit DECIMAL(12, 2),
    is_active BOOLEAN NOT NULL DEFAULT TRUE,
    customer_since DATE NOT NULL,
    notes TEXT
);

CREATE TABLE contacts (
    id INTEGER PRIMARY KEY,
    customer_id INTEGER NOT NULL REFERENCES customers (id),
    full_name TEXT NOT NULL,
    email VARCHAR(120),
    phone VARCHAR(40),
    birthday DATE
);

CREATE TABLE suppliers (
    id INTEGER PRIMARY KEY,
    name TEXT NOT NULL,
    country_code TEXT NOT NULL REFERENCES countries,
    rating REAL,
    delivers_until TIME
);

CREATE TABLE categories (
    id INTEGER PRIMARY KEY,
    parent_id INTEGER REFERENCES categories (id),
    name TEXT NOT NULL
);

CREATE TABLE products (
    id INTEGER PRIMARY KEY,
    sku CHAR(8) NOT NULL UNIQUE,
    name TEXT NOT NULL,
    category_id INTEGER NOT NULL REFERENCES categories (id),
    supplier_id INTEGER NOT NULL REFERENCES suppliers (id),
    unit_price DECIMAL(10, 2) NOT NULL,
    weight_kg REAL,
    is_discontinued BOOLEAN NOT NULL DEFAULT FALSE
);

CREATE TABLE warehouses (
    id INTEGER PRIMARY KEY,
    name TEXT NOT NULL,
    city TEXT NOT NULL,
    country_code TEXT NOT NULL REFERENCES countries,
    opens_at TIME NOT NULL,
    closes_at TIME NOT NULL
);

CREATE TABLE stock (
    warehouse_id INTEGER NOT NULL REFERENCES warehouses (id),
    product_id INTEGER NOT NULL REFERENCES products (id),
    quantity INTEGER NOT NULL,
    reorder_level INTEGER NOT NULL,
    counted_at TIMESTAMP,
    PRIMARY KEY (warehouse_id, product_id)
) WITHOUT ROWID;

CREATE TABLE orders (
    id INTEGER PRIMARY KEY,
    customer_id INTEGER NOT NULL REFERENCES customers (id),
    contact_id INTEGER REFERENCES contacts (id),
    employee_id INTEGER NOT NULL REFERENCES employees (id),
    ordered_at TIMESTAMP NOT NULL,
    due_on DATE NOT NULL,
    status TEXT NOT NULL CHECK (status IN ('open', 'shipped', 'paid', 'cancelled'))
);

CREATE TABLE order_lines (
    order_id INTEGER NOT NULL REFERENCES orders (id),
    line_no SMALLINT NOT NULL,
    product_id INTEGER NOT NULL REFERENCES products (id),
    quantity INTEGER NOT NULL,
    unit_price DECIMAL(10, 2) NOT NULL,
    discount DECIMAL(4, 2) NOT NULL DEFAULT 0,
    PRIMARY KEY (order_id, line_no)
) WITHOUT ROWID;

CREATE TABLE shipments (
    id INTEGER PRIMARY KEY,
    warehouse_id INTEGER NOT NULL REFERENCES warehouses (id),
    carrier TEXT NOT NULL,
    shipped_at TIMESTAMP NOT NULL,
    delivered_on DATE
);

CREATE TABLE shipment_lines (
    shipment_id INTEGER NOT NULL REFERENCES shipments (id),
    order_id INTEGER NOT NULL,
    line_no SMALLINT NOT NULL,
    quantity INTEGER NOT NULL,
    PRIMARY KEY (shipment_id, order_id, line_no),
    FOREIGN KEY (order_id, line_no) REFERENCES order_lines (order_id, line_no)
) WITHOUT ROWID;

CREATE TABLE payments (
    id INTEGER PRIMARY KEY,
    order_id INTEGER NOT NULL REFERENCES orders (id),
    paid_on DATE NOT NULL,
    amount DECIMAL(12, 2) NOT NULL,
    method TEXT NOT NULL,
    is_refund BOOLEAN NOT NULL DEFAULT FALSE
);

CREATE INDEX customers_by_country ON customers (country_code);
CREATE INDEX contacts_by_customer ON contacts (customer_id);
CREATE INDEX products_by_category ON products (category_id);
CREATE INDEX orders_by_customer ON orders (customer_id);
CREATE INDEX order_lines_by_product ON order_lines (product_id);
CREATE INDEX shipment_lines_by_order_line ON shipment_lines (order_id, line_no);
CREATE INDEX payments_by_order ON payments (order_id);

CREATE VIEW order_totals AS
SELECT o.id AS order_id, o.customer_id, o.ordered_at,
       ROUND(SUM(l.quantity * l.unit_price * (1 - l.discount)), 2) AS total
FROM orders AS o
JOIN order_lines AS l ON l.order_id = o.id
GROUP BY o.id;

CREATE VIEW products_to_reorder AS
SELECT p.id AS product_id, p.sku, p.name, w.name AS warehouse, s.quantity, s.reorder_level
FROM stock AS s
JOIN products AS p ON p.id = s.product_id
JOIN warehouses AS w ON w.id = s.warehouse_id
WHERE s.quantity < s.reorder_level AND NOT p.is_discontinued;
