// Shows of a page's tables only the rows that hold every word typed, and of its sections only those with such rows.
document.addEventListener("DOMContentLoaded", () => {
    const box = document.getElementById("filter");
    if (!box) return;
    box.innerHTML = '<input type="search" placeholder="Part of a name, a layout, a family ..." ' +
        'aria-label="Show the exports that hold these words"/><p></p>';
    const input = box.querySelector("input"), count = box.querySelector("p");
    const sections = [];
    for (const table of document.querySelectorAll("table.markdownTable")) {
        const heading = [];
        for (let above = table.previousElementSibling; above && above.tagName !== "TABLE" && above !== box;
             above = above.previousElementSibling) {
            heading.push(above);
            if (/^H\d$/.test(above.tagName)) break;
        }
        const title = heading.length ? heading[heading.length - 1].textContent.toLowerCase() : "";
        const rows = [...table.querySelectorAll("tr")].slice(1).map(
            (row) => ({row, text: row.textContent.toLowerCase() + " " + title}));
        sections.push({parts: [table, ...heading], rows});
    }
    const show = () => {
        const words = input.value.toLowerCase().split(/\s+/).filter((word) => word);
        let total = 0;
        for (const {parts, rows} of sections) {
            let shown = 0;
            for (const {row, text} of rows) {
                row.hidden = !words.every((word) => text.includes(word));
                if (!row.hidden) ++shown;
            }
            for (const part of parts) part.hidden = shown === 0;
            total += shown;
        }
        count.textContent = total === 1 ? "1 export" : total + " exports";
    };
    input.addEventListener("input", show);
    if (location.search.length > 1) input.value = decodeURIComponent(location.search.slice(1).replace(/\+/g, " "));
    show();
});
