// The parts below the plots.

// Columns: {title, isNumber}. Rows: arrays of texts.
function addTable(parent, columns, rows) {
    const cell = (name, column, text) => element(name, {className: column.isNumber ? 'number' : '', textContent: text});
    const head = element('tr', {}, ...columns.map((column) => {
        const node = cell('th', column, column.title);
        node.scope = 'col';
        return node;
    }));
    const body = rows.map((row) => element('tr', {}, ...row.map((text, i) => cell('td', columns[i], text))));
    parent.append(element('div', {className: 'scroll', tabIndex: 0, role: 'group'},
        element('table', {}, element('thead', {}, head), element('tbody', {}, ...body))));
}

function addSection(title, id) {
    const section = element('section', {id}, element('h2', {textContent: title}));
    byId('tables').append(section);
    return section;
}

const texts = (...titles) => titles.map((title) => ({title}));
const numbers = (...titles) => titles.map((title) => ({title, isNumber: true}));

// Texts of levels, all with as many decimals as one of them needs.
function levelTexts(levels, member) {
    const decimals = decimalsOf(levels.map((level) => level[member]));
    return levels.map((level) =>
        level[member] === null ? '—' : `${numberText(level[member], decimals)} ${level.unit}`.trim());
}
// Rows of columns.
const transposed = (columns) => columns[0].map((_, row) => columns.map((column) => column[row]));

function addServingCells() {
    const groups = report.servingCells.filter((group) => group.cells.length > 0);
    if (groups.length === 0)
        return;
    const section = addSection('Serving cells', 'serving-cells');
    for (const group of groups) {
        if (groups.length > 1 || group.title !== 'Serving cell')
            section.append(element('h3', {textContent: group.title}));
        const columns = [...texts('Cell'), ...numbers('Time', 'Share', 'Visits'),
            ...group.levels.flatMap((level) => numbers(`${level} best`, 'median', 'worst'))];
        const {cells} = group;
        addTable(section, columns, transposed([cells.map((cell) => cell.name),
            cells.map((cell) => durationText(cell.duration)), cells.map((cell) => percentText(cell.share)),
            cells.map((cell) => grouped(cell.visits)),
            ...group.levels.flatMap((_, i) => ['best', 'median', 'worst'].map((member) =>
                levelTexts(cells.map((cell) => cell.levels[i]), member)))]));
        addRemark(section, group.omitted, 'cells');
    }
}

function addRemark(section, omitted, what) {
    if (omitted > 0)
        section.append(element('p', {className: 'remark',
            textContent: `${grouped(omitted)} more ${what} came later and are left out.`}));
}

function addNeighbours() {
    const lists = report.neighbours.filter((list) => list.cells.length > 0);
    if (lists.length === 0)
        return;
    const section = addSection('Neighbours', 'neighbours');
    for (const list of lists) {
        section.append(element('h3', {textContent: list.title}));
        const hasLevel = list.level !== '';
        const columns = [...texts('Cell'), ...numbers('Samples'),
            ...(hasLevel ? numbers(`${list.level} best`, 'median', 'last') : [])];
        const cells = hasLevel ? list.cells.sort((a, b) => (b.best ?? -Infinity) - (a.best ?? -Infinity)) : list.cells;
        addTable(section, columns, transposed([cells.map((cell) => shortName(cell.name)),
            cells.map((cell) => grouped(cell.samples)),
            ...(hasLevel ? ['best', 'median', 'last'].map((member) => levelTexts(cells, member)) : [])]));
        addRemark(section, list.omitted, 'cells');
    }
}

function addContexts() {
    const {columns, rows, omitted} = report.contexts;
    if (rows.length === 0)
        return;
    const section = addSection('Packet data contexts', 'contexts');
    addTable(section, texts(...columns, 'Shown'), rows.map((row) => [...row.texts,
        `${timeOfDay(row.from)} – ${row.until ? timeOfDay(row.until) : 'end'}`]));
    addRemark(section, omitted, 'contexts');
}

// The SIM's files as they were at the end, wherever the technology's template puts them.
function branchNamed(name, node) {
    for (const child of node.children ?? []) {
        const found = child.name === name && child.children ? child : branchNamed(name, child);
        if (found)
            return found;
    }
    return null;
}

function addSim() {
    const files = (branchNamed('SIM Info', report.tree)?.children ?? []).filter((child) => child.value);
    if (files.length > 0)
        addTable(addSection('SIM', 'sim'), texts('File', 'Value'), files.map((file) => [file.name, file.value]));
}

function addCodes() {
    const section = addSection('Log codes', 'log-codes');
    const total = report.codes.reduce((sum, code) => ({packets: sum.packets + code.packets, bytes: sum.bytes + code.bytes,
        decoded: sum.decoded + code.decoded, tooShort: sum.tooShort + code.tooShort,
        unwanted: sum.unwanted + code.unwanted}), {packets: 0, bytes: 0, decoded: 0, tooShort: 0, unwanted: 0});
    const row = (code) => [code.code, code.name ?? '',
        ...[code.packets, code.bytes, code.decoded, code.tooShort, code.unwanted].map(grouped),
        ...[code.first, code.last].map((time) => time ? time.slice(11, 23) : '—')];
    addTable(section, [...texts('Code', 'Shown as'),
        ...numbers('Packets', 'Bytes', 'Decoded', 'Too short', 'Unwanted', 'First', 'Last')],
        [...report.codes.map(row), row({code: 'total', ...total})]);
}

function addGaps() {
    const section = addSection('Gaps', 'gaps');
    if (report.gaps.length === 0) {
        section.append(element('p', {textContent: 'No pause between messages is longer than 10 s.'}));
        return;
    }
    section.append(element('p', {textContent: 'Pauses of more than 10 s without a message.'}));
    addTable(section, numbers('From', 'To', 'Length'),
        report.gaps.map(([from, to]) => [dateAndTime(from), dateAndTime(to), durationText(to - from)]));
    addRemark(section, report.gapsOmitted, 'gaps');
}

function treeNode(node) {
    if (!node.children)
        return element('div', {className: 'leaf'}, element('span', {className: 'row-name', textContent: node.name}),
            element('span', {className: 'row-value', textContent: node.value ?? ''}));
    if (node.children.length === 0)
        return element('div', {className: 'leaf empty', textContent: node.name});
    return element('details', {}, element('summary', {textContent: node.name}), ...node.children.map(treeNode));
}

function addTree() {
    const section = addSection('The display at the end', 'tree');
    const tree = element('div', {className: 'tree'}, ...(report.tree.children ?? []).map(treeNode));
    const button = element('button', {type: 'button', textContent: 'Expand all'});
    button.addEventListener('click', () => {
        const isOpening = button.textContent === 'Expand all';
        tree.querySelectorAll('details').forEach((details) => { details.open = isOpening; });
        button.textContent = isOpening ? 'Collapse all' : 'Expand all';
    });
    section.append(button, tree);
}
