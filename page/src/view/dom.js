/**
 * @template {keyof HTMLElementTagNameMap} Tag
 * @param {Tag} tag
 * @param {Record<string, string | boolean | (() => void)>} attributes true sets an attribute without a value, false
 *   omits it, a function handles the event of that name
 * @param {...(Node | string)} children
 * @returns {HTMLElementTagNameMap[Tag]}
 */
export function create(tag, attributes = {}, ...children) {
  const element = document.createElement(tag);
  for (const [name, value] of Object.entries(attributes)) {
    if (typeof value === 'function') {
      element.addEventListener(name, value);
    } else if (value !== false) {
      element.setAttribute(name, value === true ? '' : value);
    }
  }
  element.append(...children);
  return element;
}

/**
 * @template {HTMLElement} Type
 * @param {string} id
 * @param {new () => Type} type
 * @returns {Type}
 */
export function get(id, type) {
  const element = document.getElementById(id);
  if (!(element instanceof type)) {
    throw new Error(`the page lacks ${id}`);
  }
  return element;
}

/**
 * @param {number} count
 * @param {string} noun
 */
export function plural(count, noun) {
  return `${count.toLocaleString('en')} ${noun}${count === 1 ? '' : 's'}`;
}
