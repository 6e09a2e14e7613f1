// What the reader does with the page: filters, highlighting, the active and the pinned cell, and
// the link that restores them.

const matrix = new Matrix(JSON.parse(element('matrix-data').textContent));
const grid = new Grid(matrix);
const filters = { front: '', requested: '', only: false, highlighted: new Set() };
let tipCell = null; // of which the tooltip tells

// --- What a cell means ---

function pairNodes({ front, requested }) {
    return [nameNode(matrix.popups[front]), ' ← ', nameNode(matrix.popups[requested])];
}

function reasonNodes(reason) {
    const nodes = [make('p', 'reason', reason.text)];
    const place = matrix.place(reason);
    if (place) {
        nodes.push(make('span', 'place', place), make('span', 'pointer', reason.pointer));
    }
    return nodes;
}

function cellTip(cell) {
    const title = make('p', 'title', ...pairNodes(cell), ': ',
        make('strong', '', matrix.behavior(cell).name));
    return [title, ...reasonNodes(matrix.reason(cell))];
}

function nameTip(popup) {
    const kind = { wildcard: 'any other popup of this wildcard',
        other: 'any popup that has no row of its own' }[popup.kind];
    return [make('p', 'title', nameNode(popup)), ...(kind ? [make('p', 'quiet', kind)] : [])];
}

// --- Tooltip ---

function showTip(cell) {
    tipCell = cell;
    const whole = cell?.front !== undefined && cell?.requested !== undefined;
    const tip = element('tip');
    tip.hidden = !cell;
    if (cell) {
        tip.replaceChildren(...(whole
            ? cellTip(cell) : nameTip(matrix.popups[cell.front ?? cell.requested])));
    }
    grid.mark('hot', cell);
}

/** Beside the cell, below or above it, wherever there is room in the window. */
function placeTip() {
    const tip = element('tip');
    if (!tip.hidden) {
        const { left, top } = grid.rectOf(tipCell);
        const { offsetWidth, offsetHeight } = tip;
        const below = top + CELL_HEIGHT + 8;
        const x = Math.max(8, Math.min(left + CELL_WIDTH, innerWidth - offsetWidth - 8));
        const y = below + offsetHeight < innerHeight ? below : top - offsetHeight - 8;
        tip.style.transform = `translate(${x}px, ${Math.max(8, y)}px)`;
    }
}

// --- Details of the pinned cell ---

function pin(cell) {
    grid.mark('pinned', cell);
    const panel = element('panel');
    panel.classList.toggle('pinned', cell !== null);
    panel.replaceChildren(...(cell ? details(cell) : hint()));
    tellWhetherHidden();
    writeLink();
}

/** By itself, because assistive technology would read anew a panel that is made anew. */
function tellWhetherHidden() {
    const { pinned } = grid.marked;
    const note = element('panel').querySelector('.hidden-note');
    if (note) {
        note.hidden = grid.rowOf(pinned) >= 0 && grid.columnOf(pinned) >= 0;
    }
}

function hint() {
    return [make('h2', '', 'Details'), make('p', 'quiet',
        'Click a cell, or move to it with the arrow keys and press Enter, to keep its details '
        + 'here.')];
}

function details(cell) {
    const { name, letter, meaning } = matrix.behavior(cell);
    const reason = matrix.reason(cell);
    return [
        make('dl', '', make('dt', '', 'in front'), make('dd', '', nameNode(popupOf(cell.front))),
            make('dt', '', 'requested'), make('dd', '', nameNode(popupOf(cell.requested)))),
        make('h2', 'verdict', sample(name, letter, reason.kind), name),
        make('p', '', `${meaning[0].toUpperCase()}${meaning.slice(1)}.`),
        ...reasonNodes(reason),
        make('p', 'quiet hidden-note', 'The filters hide this cell.'),
        make('h3', '', 'The other way round'),
        otherWayRound({ front: cell.requested, requested: cell.front }),
        ...blockedNodes(cell.requested),
        button('unpin', () => { pin(null); grid.scroller.focus(); }, 'Close the details (Escape)'),
    ];
}

const popupOf = index => matrix.popups[index];

function sample(name, letter, kind) {
    return make('span', `cell sample ${name.toLowerCase()} by-${kind}`,
        kind === 'none' ? '·' : letter);
}

function button(className, act, ...content) {
    const node = make('button', className, ...content);
    node.type = 'button';
    node.addEventListener('click', act);
    return node;
}

function otherWayRound(cell) {
    const look = () => {
        activate(cell);
        pin(cell);
        grid.scroller.focus(); // the button that had the focus is gone
    };
    return button('transposed', look, ...pairNodes(cell), `: ${matrix.behavior(cell).name}`);
}

function blockedNodes(requested) {
    const { domains, domainReason, views, viewReason } = matrix.blocked[requested];
    return [
        make('h3', '', 'Where ', nameNode(popupOf(requested)), ' is blocked'),
        ...blacklistNodes('In the domains', domains, domainReason),
        ...blacklistNodes('On the views', views, viewReason),
        ...(domains.length + views.length === 0 ? [make('p', 'quiet', 'Nowhere.')] : []),
    ];
}

function blacklistNodes(title, names, reason) {
    return names.length === 0 ? [] : [make('p', '', title),
        make('ul', 'blocked', ...names.map(text => make('li', '', make('bdi', '', text)))),
        ...reasonNodes(reason)];
}

// --- Filters and highlighting ---

function makeBehaviorButtons() {
    const used = new Set(matrix.reasons.map(reason => reason.behavior));
    BEHAVIORS.forEach(({ name, letter, meaning }, code) => {
        const node = button('behavior', () => toggleHighlight(code),
            sample(name, letter, 'rule'), make('span', 'label', name), make('span', 'count'),
            make('span', 'meaning', meaning));
        node.hidden = name === 'invalid' && !used.has(name);
        element('behaviors').append(node);
    });
}

function toggleHighlight(code) {
    const { highlighted } = filters;
    if (!highlighted.delete(code)) {
        highlighted.add(code);
    }
    refresh();
}

/** Applies the filters to everything that shows them. */
function refresh() {
    const selection = select(matrix, filters);
    grid.show(selection, filters.highlighted);
    showTip(null);
    keepActive(selection);
    [...element('behaviors').children].forEach((node, code) => {
        node.setAttribute('aria-pressed', filters.highlighted.has(code));
        node.querySelector('.count').textContent = selection.counts[code];
    });
    element('only').disabled = filters.highlighted.size === 0;
    element('extent').textContent = `${selection.rows.length} × ${selection.columns.length} `
        + `of ${matrix.popups.length} × ${matrix.popups.length} cells`;
    tellWhetherHidden();
    writeLink();
}

/** The active cell stays where the filters leave it, else the first becomes active. */
function keepActive({ rows, columns }) {
    const { active } = grid.marked;
    if (grid.rowOf(active) < 0 || grid.columnOf(active) < 0) {
        grid.mark('active', rows.length && columns.length
            ? { front: rows[0], requested: columns[0] } : null);
    }
}

function readControls() {
    filters.front = element('front').value;
    filters.requested = element('requested').value;
    filters.only = element('only').checked;
    refresh();
}

// --- The link: what is set stands behind the # of the address ---

function writeLink() {
    const { pinned } = grid.marked;
    const link = new URLSearchParams();
    const put = (key, value) => value && link.set(key, value);
    put('front', filters.front);
    put('requested', filters.requested);
    put('highlight', [...filters.highlighted].map(code => BEHAVIORS[code].name).join());
    put('only', filters.only ? '1' : '');
    put('pin-front', pinned && popupOf(pinned.front).name);
    put('pin-requested', pinned && popupOf(pinned.requested).name);
    // Replaced, because each letter that is typed would be a step back otherwise.
    history.replaceState(null, '', `#${link}`);
}

function readLink() {
    const link = new URLSearchParams(location.hash.slice(1));
    const names = (link.get('highlight') ?? '').split(',');
    filters.highlighted = new Set([...BEHAVIORS.keys()]
        .filter(code => names.includes(BEHAVIORS[code].name)));
    element('front').value = link.get('front') ?? '';
    element('requested').value = link.get('requested') ?? '';
    element('only').checked = link.get('only') === '1';
    const cell = { front: matrix.popupNamed(link.get('pin-front')),
        requested: matrix.popupNamed(link.get('pin-requested')) };
    readControls();
    pin(cell.front < 0 || cell.requested < 0 ? null : cell);
}

// --- Mouse and keys ---

/** Makes a cell of the grid active and brings it into sight, if the filters leave it. */
function activate(cell) {
    if (grid.rowOf(cell) >= 0 && grid.columnOf(cell) >= 0) {
        grid.mark('active', cell);
        grid.scrollTo(cell);
    }
}

function move(rowStep, columnStep) {
    const { rows, columns } = grid.selection;
    const { active } = grid.marked;
    const clamp = (value, length) => Math.min(length - 1, Math.max(0, value));
    if (active) {
        activate({ front: rows[clamp(grid.rowOf(active) + rowStep, rows.length)],
            requested: columns[clamp(grid.columnOf(active) + columnStep, columns.length)] });
        showTip(grid.marked.active);
    }
}

/** The rows and columns by which a key moves; undefined for other keys. */
function stepOf({ key, ctrlKey }) {
    const page = Math.max(1, grid.lines.length - 2);
    const rows = ctrlKey ? Infinity : 0;
    return { ArrowUp: [-1, 0], ArrowDown: [1, 0], ArrowLeft: [0, -1], ArrowRight: [0, 1],
        PageUp: [-page, 0], PageDown: [page, 0], Home: [-rows, -Infinity],
        End: [rows, Infinity] }[key];
}

function onGridKey(event) {
    const step = event.altKey || event.metaKey ? undefined : stepOf(event);
    if (step) {
        move(...step);
    } else if ((event.key === 'Enter' || event.key === ' ') && grid.marked.active) {
        pin(grid.marked.active);
    } else {
        return;
    }
    event.preventDefault();
}

function onClick(event) {
    const cell = grid.cellOf(event.target);
    if (cell?.front !== undefined && cell.requested !== undefined) {
        grid.mark('active', cell);
        pin(cell);
    }
}

function onEscape(event) {
    // In a filter, Escape empties the filter.
    if (event.key === 'Escape' && event.target.type !== 'search') {
        showTip(null);
        pin(null);
    }
}

function listen() {
    for (const id of ['front', 'requested', 'only']) {
        element(id).addEventListener('input', readControls);
    }
    grid.scroller.addEventListener('mouseover', event => showTip(grid.cellOf(event.target)));
    grid.scroller.addEventListener('mouseleave', () => showTip(null));
    grid.scroller.addEventListener('wheel', () => showTip(null), { passive: true });
    grid.scroller.addEventListener('blur', () => showTip(null));
    grid.scroller.addEventListener('click', onClick);
    grid.scroller.addEventListener('keydown', onGridKey);
    document.addEventListener('keydown', onEscape);
    addEventListener('hashchange', readLink);
    addEventListener('beforeprint', () => grid.unfold());
    addEventListener('afterprint', () => grid.fold());
    grid.afterPaint = placeTip;
}

function start() {
    document.title = `${matrix.title}: popup interruptions`;
    element('files').textContent = matrix.files.join(', ');
    makeBehaviorButtons();
    listen();
    readLink();
    if (grid.marked.pinned) {
        activate(grid.marked.pinned);
    }
}

start();
