// The grid draws only the cells in sight, and moves their nodes as it scrolls, so that thousands of
// popups scroll as smoothly as ten.

const CELL_WIDTH = 24;
const CELL_HEIGHT = 22;
const CHARACTER_WIDTH = 8.5; // of a wide font: a little room to spare is better than names cut off
const MOST_PRINTED_CELLS = 10000; // more could not be read on paper
const PRINTED_WIDTH = 1040; // of a landscape A4 sheet in CSS pixels, without its margins

const element = id => document.getElementById(id);

/** A new element with texts and elements in it. Names may hold anything: they are text only. */
function make(tag, className, ...content) {
    const node = document.createElement(tag);
    node.className = className;
    node.append(...content);
    return node;
}

/** A name within a sentence, which its own direction of writing must not turn around. */
const nameNode = popup => make('bdi', popup.kind, popup.name);

class Grid {
    constructor(matrix) {
        this.matrix = matrix;
        this.scroller = element('grid');
        this.canvas = element('canvas');
        this.head = element('head');
        this.lines = []; // row n is drawn by the node n modulo their number: a step redraws one
        this.heads = []; // the same for columns
        this.version = 0; // of what the rows and columns mean; a node of an older one is redrawn
        this.marked = { active: null, hot: null, pinned: null };
        this.afterPaint = () => {};
        this.setSizes();
        this.scroller.addEventListener('scroll', () => this.schedule(), { passive: true });
        new ResizeObserver(() => this.fold()).observe(this.scroller);
        this.fold();
    }

    setSizes() {
        const longest = Math.max(0, ...this.matrix.popups.map(popup => popup.name.length));
        this.nameWidth = Math.min(230, Math.max(120, longest * CHARACTER_WIDTH + 16));
        this.headHeight = Math.min(170, Math.max(80, longest * CHARACTER_WIDTH + 12));
        const style = this.scroller.style;
        document.documentElement.style.setProperty('--cell-width', `${CELL_WIDTH}px`);
        document.documentElement.style.setProperty('--cell-height', `${CELL_HEIGHT}px`);
        style.setProperty('--name-width', `${this.nameWidth}px`);
        style.setProperty('--head-height', `${this.headHeight}px`);
    }

    get width() { return this.nameWidth + this.selection.columns.length * CELL_WIDTH; }
    get height() { return this.headHeight + this.selection.rows.length * CELL_HEIGHT; }

    show(selection, highlighted) {
        Object.assign(this, { selection, highlighted });
        ++this.version;
        const empty = selection.rows.length === 0 || selection.columns.length === 0;
        this.canvas.hidden = empty;
        element('empty').hidden = !empty;
        this.canvas.style.width = `${this.width}px`;
        this.canvas.style.height = `${this.height}px`;
        this.scroller.setAttribute('aria-rowcount', selection.rows.length + 1);
        this.scroller.setAttribute('aria-colcount', selection.columns.length + 1);
        this.schedule();
    }

    /** Makes as many nodes as fit into the sizes, and one more where the first is cut off. */
    resize(width, height) {
        const columns = Math.max(1, Math.ceil((width - this.nameWidth) / CELL_WIDTH) + 1);
        const rows = Math.max(1, Math.ceil((height - this.headHeight) / CELL_HEIGHT) + 1);
        this.viewWidth = width;
        this.viewHeight = height;
        if (rows !== this.lines.length || columns !== this.heads.length) {
            [...this.heads, ...this.lines].forEach(node => node.remove());
            this.heads = Array.from({ length: columns }, makeColumnHead);
            this.lines = Array.from({ length: rows }, (_, index) => makeLine(index, columns));
            this.head.append(...this.heads);
            this.head.after(...this.lines);
        }
        this.schedule();
    }

    schedule() {
        this.frame ??= requestAnimationFrame(() => this.paint());
    }

    /** Reads the place first and only writes then, so that a frame has one layout. */
    paint() {
        this.frame = undefined;
        const firstRow = Math.floor(this.scroller.scrollTop / CELL_HEIGHT);
        const firstColumn = Math.floor(this.scroller.scrollLeft / CELL_WIDTH);
        for (let column = firstColumn; column < firstColumn + this.heads.length; ++column) {
            this.paintHead(this.heads[column % this.heads.length], column);
        }
        for (let row = firstRow; row < firstRow + this.lines.length; ++row) {
            this.paintLine(this.lines[row % this.lines.length], row, firstColumn);
        }
        this.paintMarks();
        this.afterPaint();
    }

    /** Whether a node has to be drawn anew; remembers that it is. What lies beyond is hidden. */
    isStale(node, row, column, exists) {
        if (node.row === row && node.column === column && node.version === this.version) {
            return false;
        }
        Object.assign(node, { row, column, version: this.version, hidden: !exists });
        return exists;
    }

    paintHead(node, column) {
        const { columns } = this.selection;
        if (this.isStale(node, -1, column, column < columns.length)) {
            const popup = this.matrix.popups[columns[column]];
            node.className = `requested ${popup.kind}`;
            node.classList.toggle('new-module',
                this.matrix.startsModule(columns[column], columns[column - 1]));
            node.style.transform = `translateX(${column * CELL_WIDTH}px)`;
            node.setAttribute('aria-colindex', column + 2);
            node.firstChild.textContent = popup.name;
        }
    }

    paintLine(line, row, firstColumn) {
        const { rows, columns } = this.selection;
        if (this.isStale(line, row, -1, row < rows.length)) {
            const popup = this.matrix.popups[rows[row]];
            const first = this.matrix.startsModule(rows[row], rows[row - 1]) ? ' new-module' : '';
            line.className = `row${first}`;
            line.style.transform = `translateY(${row * CELL_HEIGHT}px)`;
            line.setAttribute('aria-rowindex', row + 2);
            line.front.className = `front ${popup.kind}${first}`;
            line.front.textContent = popup.name;
            line.front.row = row;
        }
        if (row < rows.length) {
            for (let column = firstColumn; column < firstColumn + line.cells.length; ++column) {
                const cell = line.cells[column % line.cells.length];
                if (this.isStale(cell, row, column, column < columns.length)) {
                    this.paintCell(cell, { front: rows[row], requested: columns[column] });
                }
            }
        }
    }

    paintCell(node, cell) {
        const reason = this.matrix.reason(cell);
        const behavior = this.matrix.behavior(cell);
        const code = this.matrix.code(cell.front, cell.requested);
        const dim = this.highlighted.size > 0 && !this.highlighted.has(code) ? ' dim' : '';
        const first = this.matrix.startsModule(cell.requested,
            this.selection.columns[node.column - 1]) ? ' new-module' : '';
        node.className = `cell ${behavior.name.toLowerCase()} by-${reason.kind}${dim}${first}`;
        node.textContent = reason.kind === 'none' ? '·' : behavior.letter;
        node.style.transform = `translateX(${node.column * CELL_WIDTH}px)`;
        node.setAttribute('aria-colindex', node.column + 2);
        node.setAttribute('aria-label', `${behavior.name}, ${DECIDED_BY[reason.kind]}`);
    }

    /** Marks a cell, or the whole row or column when the other is missing; null marks none. */
    mark(kind, cell) {
        this.marked[kind] = cell;
        this.schedule();
    }

    paintMarks() {
        const { hot, pinned, active } = this.marked;
        const hotRow = this.rowOf(hot);
        const hotColumn = this.columnOf(hot);
        this.lines.forEach(line => line.front.classList.toggle('hot', line.row === hotRow));
        this.heads.forEach(node => node.classList.toggle('hot', node.column === hotColumn));
        placeMark(element('row-band'), hotRow, 0, `${this.width - this.nameWidth}px`,
            `${CELL_HEIGHT}px`);
        placeMark(element('column-band'), 0, hotColumn, `${CELL_WIDTH}px`,
            `${this.height - this.headHeight}px`);
        placeMark(element('pin-mark'), this.rowOf(pinned), this.columnOf(pinned));
        placeMark(element('cursor'), this.rowOf(active), this.columnOf(active));
        this.announce(active);
    }

    /** Tells assistive technology which cell is active, while a node draws it. */
    announce(active) {
        const node = active && this.nodeOf(active);
        if (node) {
            this.scroller.setAttribute('aria-activedescendant', node.id);
        } else {
            this.scroller.removeAttribute('aria-activedescendant');
        }
    }

    nodeOf(cell) {
        const row = this.rowOf(cell);
        const column = this.columnOf(cell);
        const node = row < 0 || column < 0 ? null
            : this.lines[row % this.lines.length].cells[column % this.heads.length];
        return node && node.row === row && node.column === column ? node : null;
    }

    rowOf(cell) {
        return cell?.front === undefined ? -1 : this.selection.rowOf[cell.front];
    }

    columnOf(cell) {
        return cell?.requested === undefined ? -1 : this.selection.columnOf[cell.requested];
    }

    /** The cell that a node draws; of a name's node only the popup in front or requested. */
    cellOf(node) {
        const drawn = node.closest?.('.cell, .front, .requested');
        return drawn && this.canvas.contains(drawn) ? {
            front: this.selection.rows[drawn.row],
            requested: this.selection.columns[drawn.column],
        } : null;
    }

    scrollTo(cell) {
        const { scroller } = this;
        scroller.scrollTop = nearest(scroller.scrollTop, this.rowOf(cell) * CELL_HEIGHT,
            CELL_HEIGHT, this.viewHeight - this.headHeight);
        scroller.scrollLeft = nearest(scroller.scrollLeft, this.columnOf(cell) * CELL_WIDTH,
            CELL_WIDTH, this.viewWidth - this.nameWidth);
    }

    /** Where a cell is in the window; of a name, where the name is. */
    rectOf(cell) {
        const { left, top } = this.scroller.getBoundingClientRect();
        const row = this.rowOf(cell);
        const column = this.columnOf(cell);
        return {
            left: column < 0 ? left
                : left + this.nameWidth + column * CELL_WIDTH - this.scroller.scrollLeft,
            top: row < 0 ? top + this.headHeight - CELL_HEIGHT
                : top + this.headHeight + row * CELL_HEIGHT - this.scroller.scrollTop,
        };
    }

    /** Draws all rows and columns at once, for paper, which does not scroll. */
    unfold() {
        if (this.selection.rows.length * this.selection.columns.length <= MOST_PRINTED_CELLS) {
            const { style } = this.scroller;
            style.setProperty('--print-zoom', Math.min(1, PRINTED_WIDTH / this.width));
            this.scroller.scrollTo(0, 0);
            this.resize(this.width, this.height);
            this.paint();
        }
    }

    /** Draws what fits into the window again. */
    fold() {
        this.resize(this.scroller.clientWidth, this.scroller.clientHeight);
    }
}

function makeColumnHead() {
    const name = make('span', '');
    name.dir = 'auto';
    const node = make('div', 'requested', name);
    node.setAttribute('role', 'columnheader');
    return node;
}

function makeLine(index, columns) {
    const line = make('div', 'row');
    line.setAttribute('role', 'row');
    line.front = make('div', 'front');
    line.front.setAttribute('role', 'rowheader');
    line.front.setAttribute('aria-colindex', 1);
    line.front.dir = 'auto';
    line.cells = Array.from({ length: columns }, (_, column) => {
        const cell = make('div', 'cell');
        cell.id = `cell-${index}-${column}`;
        cell.setAttribute('role', 'gridcell');
        return cell;
    });
    line.append(line.front, ...line.cells);
    return line;
}

function placeMark(node, row, column, width, height) {
    node.hidden = row < 0 || column < 0;
    node.style.transform = `translate(${column * CELL_WIDTH}px, ${row * CELL_HEIGHT}px)`;
    if (width) {
        Object.assign(node.style, { width, height });
    }
}

/** The scroll position nearest to the present one that shows all of an item. */
function nearest(position, start, size, room) {
    return Math.min(start, Math.max(position, start + size - room));
}
