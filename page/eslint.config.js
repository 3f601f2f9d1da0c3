/** Only rules of the linter itself; the types are checked by tsc. */
const browser = { window: 'readonly', document: 'readonly', requestAnimationFrame: 'readonly', performance: 'readonly',
  getComputedStyle: 'readonly', HTMLElement: 'readonly', HTMLInputElement: 'readonly', Event: 'readonly',
  fetch: 'readonly', URL: 'readonly', process: 'readonly' };

export default [
  { ignores: ['dist/', 'node_modules/'] },
  {
    languageOptions: { ecmaVersion: 2023, sourceType: 'module' },
    linterOptions: { reportUnusedDisableDirectives: 'error' },
    rules: {
      'no-unused-vars': 'error',
      'no-var': 'error',
      'prefer-const': 'error',
      eqeqeq: 'error',
      curly: 'error',
      'no-shadow': 'error',
      'max-len': ['error', { code: 120 }],
      'max-lines': ['error', 390],
    },
  },
  { files: ['tests/**', 'tools/**'], languageOptions: { globals: browser }, rules: { 'no-undef': 'error' } },
];
