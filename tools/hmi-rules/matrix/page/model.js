// The data of the page, and what its filters leave of them. A cell is known by two indices into the
// list of popups, { front, requested }; its row and column depend on the filters.
'use strict';

const BEHAVIORS = [
    { name: 'Prohibit', letter: 'P', meaning: 'the request is refused' },
    { name: 'Allow', letter: 'A', meaning: 'the popup in front goes and returns afterwards' },
    { name: 'AllowStack', letter: 'S', meaning: 'the popup in front waits beneath, still stacked' },
    { name: 'AllowNoReturn', letter: 'N', meaning: 'the popup in front goes for good' },
    { name: 'invalid', letter: '!', meaning: 'a default that is none of the four; like Allow' },
];
const DECIDED_BY = { rule: 'by a rule', default: 'by a default', none: 'built in' };

class Matrix {
    constructor(data) {
        Object.assign(this, { title: data.title, files: data.files, popups: data.popups,
            reasons: data.reasons, blocked: data.blocked });
        this.rows = data.rows.map(runs => expandRuns(runs, data.popups.length));
        this.codes = Uint8Array.from(data.reasons,
            reason => BEHAVIORS.findIndex(behavior => behavior.name === reason.behavior));
    }

    reason({ front, requested }) {
        return this.reasons[this.rows[front][requested]];
    }

    behavior(cell) {
        return BEHAVIORS[this.code(cell.front, cell.requested)];
    }

    /** The index of the behaviour; takes two numbers because it is asked for millions of cells. */
    code(front, requested) {
        return this.codes[this.rows[front][requested]];
    }

    /** Where a reason stands in the files; empty for what is built in. */
    place(reason) {
        return reason.file === undefined
            ? '' : `${this.files[reason.file]}:${reason.line}:${reason.column}`;
    }

    popupNamed(name) {
        return this.popups.findIndex(popup => popup.name === name);
    }

    /** Whether a line belongs above this popup, because the one before is of another module. */
    startsModule(popup, before) {
        return before !== undefined
            && moduleOf(this.popups[popup].name) !== moduleOf(this.popups[before].name);
    }
}

function expandRuns(runs, length) {
    const row = new Uint32Array(length);
    for (let i = 0, start = 0; i < runs.length; i += 2) {
        row.fill(runs[i], start, start + runs[i + 1]);
        start += runs[i + 1];
    }
    return row;
}

function moduleOf(name) {
    return name.includes('/') ? name.slice(0, name.indexOf('/')) : '';
}

/** Whether the pieces between the stars of a word occur in a name, one after the other. */
function containsInOrder(name, pieces) {
    let from = 0;
    for (const piece of pieces) {
        const found = name.indexOf(piece, from);
        if (found < 0) {
            return false;
        }
        from = found + piece.length;
    }
    return true;
}

/** The indices of the popups that match one of a filter's words. */
function matching(popups, filter) {
    const words = filter.toLowerCase().split(',').map(word => word.trim()).filter(Boolean)
        .map(word => word.split('*'));
    return [...popups.keys()].filter(index => words.length === 0
        || words.some(pieces => containsInOrder(popups[index].name.toLowerCase(), pieces)));
}

function onlyHighlighted(matrix, rows, columns, highlighted) {
    const hotColumns = new Set();
    const hotRows = rows.filter(front => {
        const hot = columns.filter(column => highlighted.has(matrix.code(front, column)));
        hot.forEach(column => hotColumns.add(column));
        return hot.length > 0;
    });
    return [hotRows, columns.filter(column => hotColumns.has(column))];
}

function countBehaviors(matrix, rows, columns) {
    const counts = BEHAVIORS.map(() => 0);
    for (const front of rows) {
        for (const requested of columns) {
            ++counts[matrix.code(front, requested)];
        }
    }
    return counts;
}

/** For each popup its place in a list of popups; -1 where it is not in it. */
function placesIn(list, size) {
    const places = new Int32Array(size).fill(-1);
    list.forEach((popup, place) => { places[popup] = place; });
    return places;
}

/** What the filters leave: rows and columns as indices of popups, and where each popup is then. */
function select(matrix, filters) {
    let rows = matching(matrix.popups, filters.front);
    let columns = matching(matrix.popups, filters.requested);
    if (filters.only && filters.highlighted.size > 0) {
        [rows, columns] = onlyHighlighted(matrix, rows, columns, filters.highlighted);
    }
    return { rows, columns, counts: countBehaviors(matrix, rows, columns),
        rowOf: placesIn(rows, matrix.popups.length),
        columnOf: placesIn(columns, matrix.popups.length) };
}
