"use strict";
// Searches all tables, and sorts a table by a column. Without it the page is read as it stands.
(() => {
    const collator = new Intl.Collator("en", { numeric: true, sensitivity: "base" });
    const directions = { none: "ascending", ascending: "descending", descending: "none" };

    // Numbers come before texts, and cells without a value come last.
    const keyOf = (row, column) => {
        const text = row.cells[column].textContent.trim();
        if (text === "") {
            return { rank: 2 };
        }
        return /^-?\d{1,20}$/.test(text) ? { rank: 0, number: BigInt(text) } : { rank: 1, text };
    };
    const compare = (one, other, sign) => {
        if (one.rank !== other.rank) {
            return one.rank === 2 || other.rank === 2
                ? one.rank - other.rank
                : sign * (one.rank - other.rank);
        }
        if (one.rank === 0) {
            return sign * (one.number < other.number ? -1 : Number(one.number > other.number));
        }
        return one.rank === 1 ? sign * collator.compare(one.text, other.text) : 0;
    };

    const sortable = (table) => {
        const body = table.tBodies[0];
        const unsorted = [...body.rows];
        const heads = [...table.tHead.rows[0].cells];
        const sort = (column, direction) => {
            heads.forEach((head, i) => {
                head.setAttribute("aria-sort", i === column ? direction : "none");
            });
            if (direction === "none") {
                body.append(...unsorted);
                return;
            }
            const sign = direction === "ascending" ? 1 : -1;
            const keyed = unsorted.map((row) => ({ row, key: keyOf(row, column) }));
            keyed.sort((one, other) => compare(one.key, other.key, sign));
            body.append(...keyed.map((entry) => entry.row));
        };
        heads.forEach((head, column) => {
            const button = document.createElement("button");
            button.type = "button";
            button.append(...head.childNodes);
            button.addEventListener("click", () => {
                sort(column, directions[head.getAttribute("aria-sort")]);
            });
            head.append(button);
            head.setAttribute("aria-sort", "none");
        });
    };

    const lower = (text) => text.toLocaleLowerCase("en");
    const textOf = (row) => lower([...row.cells].map((cell) => cell.textContent).join(" "));
    const plural = (count, noun) => `${count} ${noun}${count === 1 ? "" : "s"}`;

    const linkTo = (heading) =>
        document.querySelector(`nav a[href="#${heading.id}"]`).parentElement;

    const headings = "h2, h3, h4";

    // What is searched: a single row stands or falls as a whole, and so do the rows below a heading
    // that has the words itself.
    const sections = [...document.querySelectorAll("section.table")].map((section) => {
        const heading = section.querySelector(headings);
        const table = section.querySelector("table");
        const rows = [...(table ? table.tBodies[0].rows : [])].map((row) => ({
            row,
            text: textOf(row),
        }));
        const single = table !== null && table.classList.contains("single");
        const values = single ? rows.map(({ text }) => text) : [];
        return {
            section,
            link: linkTo(heading),
            text: [lower(heading.textContent), ...values].join(" "),
            rows: single ? [] : rows,
            count: single ? 1 : rows.length,
        };
    });

    const showMatches = (section, words) => {
        const has = (text) => words.every((word) => text.includes(word));
        const all = has(section.text);
        let count = 0;
        for (const { row, text } of section.rows) {
            row.hidden = !all && !has(text);
            count += row.hidden ? 0 : 1;
        }
        section.section.hidden = !all && count === 0;
        section.link.hidden = section.section.hidden;
        return all ? section.count : count;
    };

    const parts = [...document.querySelectorAll("section.part")];
    const showParts = (everything) => {
        for (const part of parts) {
            part.hidden = !everything && !part.querySelector("section.table:not([hidden])");
            linkTo(part.querySelector(headings)).hidden = part.hidden;
        }
    };

    const found = document.getElementById("found");
    const search = (text) => {
        const words = lower(text).split(/\s+/).filter((word) => word !== "");
        let rows = 0;
        let tables = 0;
        for (const section of sections) {
            rows += showMatches(section, words);
            tables += section.section.hidden ? 0 : 1;
        }
        showParts(words.length === 0);
        const result = `${plural(rows, "row")} in ${plural(tables, "table")}`;
        found.textContent = words.length === 0 ? "" : tables === 0 ? "Nothing found" : result;
    };

    document.querySelectorAll("table:not(.single)").forEach(sortable);
    const input = document.getElementById("search");
    input.addEventListener("input", () => search(input.value));
    input.parentElement.hidden = false;
    if (input.value !== "") {
        search(input.value);
    }
})();
